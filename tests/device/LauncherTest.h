#pragma once

#include "device/ApplicationLock.h"
#include "device/MainLoop.h"
#include "support/Process.h"
#include "support/TemporaryDevice.h"

#include <Ecore.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <functional>

/// A device with an application com.example.tea, whose program a test writes.
class Launching : public testing::Test {
protected:
    static constexpr char tea[] = "com.example.tea";

    Launching() { device_.addPackage(tea); }

    std::filesystem::path program() const { return device_.preinstalled() / tea / "bin/app"; }
    void setProgram(const std::string& script) const {
        support::writeFile(program(), "#!/bin/sh\n" + script);
        std::filesystem::permissions(program(), std::filesystem::perms::owner_all);
    }
    using Result = device::Launcher::Result;

    Result launch(const std::vector<std::pair<std::string, std::string>>& extras = {}, const std::string& id = tea) {
        return device_->launcher().launch({device_.appId(), id, extras});
    }
    std::vector<device::LaunchRecord> records() const { return device_->launches().all(); }
    device::LaunchRecord last() const { return records().back(); }
    std::string said() const { return support::readFile(device_->folder().output(tea)); }

    /// Runs the main loop until `done` says so; it need never be waited for as long as that.
    static bool loopUntil(const std::function<bool()>& done) {
        device::startMainLoop();
        const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(20);
        Ecore_Timer* waking = ecore_timer_add(
            0.02, [](void*) -> Eina_Bool { return ECORE_CALLBACK_RENEW; }, nullptr);
        while (!done() && std::chrono::steady_clock::now() < end)
            ecore_main_loop_iterate_may_block(1);
        ecore_timer_del(waking);
        return done();
    }
    bool saysSoon(const std::string& text) {
        return loopUntil([&] { return said() == text; });
    }
    bool becomes(device::LaunchOutcome outcome) {
        return loopUntil([&] { return last().outcome == outcome; });
    }
    /// The process that is the application meanwhile, on this device.
    support::Process running() const {
        auto process = support::Process::ofWork([this] {
            const device::ApplicationLock lock(device_->folder(), tea);
            return pause();
        });
        while (!device::ApplicationLock::holder(device_->folder(), tea))
            usleep(1000);
        return process;
    }

    /// A program that goes on until endProgram().
    void setHangingProgram() const { setProgram("echo $$; exec sleep 1000\n"); }
    void endProgram() {
        ASSERT_TRUE(loopUntil([&] { return said().ends_with("\n"); }));
        kill(std::stoi(said()), SIGKILL);
    }

    support::TemporaryDevice device_;
};
