#pragma once

#include "TestDevice.h"

#include <gmock/gmock.h>

using test_tool::done;
using test_tool::failed;
using test_tool::Result;
using test_tool::wrongUsage;

/// A test that runs kest-device on a device of its own.
class ToolTest : public testing::Test {
protected:
    Result run(const std::vector<std::string>& words) { return device_.run(words); }
    std::string root() const { return device_.root().string(); }
    /// The ids of what is installed, as messages list them.
    std::string installed() const {
        std::string ids;
        for (const device::Package& package : device_.open().packages().all()) {
            ids += (ids.empty() ? "" : ", ") + package.id;
        }
        return ids;
    }

    test_tool::TestDevice device_;
};

/// One on whose device the sample application is installed.
class SampleToolTest : public ToolTest {
protected:
    static constexpr char sample[] = "com.example.sample";

    void SetUp() override { ASSERT_EQ(run({"install", SAMPLE_PACKAGE}), done("installed com.example.sample 2.5\n")); }
    /// Starts it headless, with these extras.
    Result start(const std::vector<std::string>& extras = {}) {
        std::vector<std::string> words{"start", "--headless", "--", sample};
        words.insert(words.end(), extras.begin(), extras.end());
        return run(words);
    }
};
