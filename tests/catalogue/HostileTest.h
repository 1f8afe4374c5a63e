#pragma once

#include "CatalogueTest.h"

#include <sys/resource.h>
#include <sys/stat.h>

#include <chrono>

/// Input that means harm. Nothing may hang, crash or take the machine's memory: a test that takes more of the
/// processor's time than any input may is ended.
class HostileTest : public CatalogueTest {
protected:
    HostileTest() {
        getrlimit(RLIMIT_CPU, &timeBefore_);
        rusage usage{};
        getrusage(RUSAGE_SELF, &usage);
        const rlimit time{static_cast<rlim_t>(usage.ru_utime.tv_sec + usage.ru_stime.tv_sec) + mostSeconds,
                          timeBefore_.rlim_max};
        setrlimit(RLIMIT_CPU, &time);
#if !defined(__SANITIZE_ADDRESS__)
        // A request beyond it fails, which ends the process, rather than taking the machine with it.
        limit_ = {addressSpace, addressSpace};
        setrlimit(RLIMIT_AS, &limit_);
#endif
    }
    ~HostileTest() override {
        setrlimit(RLIMIT_CPU, &timeBefore_);
        rusage usage{};
        getrusage(RUSAGE_SELF, &usage);
#if defined(__SANITIZE_ADDRESS__)
        constexpr long mostMegabytes = 3000;
#else
        constexpr long mostMegabytes = 400;
#endif
        const auto milliseconds =
            std::chrono::duration_cast<std::chrono::milliseconds>(std::chrono::steady_clock::now() - start_).count();
        EXPECT_LT(usage.ru_maxrss / 1024, mostMegabytes);
        RecordProperty("milliseconds", static_cast<int>(milliseconds));
        RecordProperty("megabytes", static_cast<int>(usage.ru_maxrss / 1024));
    }

    static void makeFifo(const std::filesystem::path& file) {
        std::filesystem::create_directories(file.parent_path());
        if (mkfifo(file.c_str(), 0600) != 0)
            throw std::runtime_error("cannot make the FIFO " + file.string());
    }

    static std::string repeated(const std::string& text, std::size_t count) {
        std::string all;
        all.reserve(text.size() * count);
        for (std::size_t i = 0; i < count; ++i)
            all += text;
        return all;
    }

private:
    static constexpr rlim_t addressSpace = rlim_t{2} << 30;
#if defined(__SANITIZE_ADDRESS__)
    static constexpr rlim_t mostSeconds = 150;
#else
    static constexpr rlim_t mostSeconds = 20;
#endif
    rlimit timeBefore_{};
    rlimit limit_{};
    std::chrono::steady_clock::time_point start_ = std::chrono::steady_clock::now();
};
