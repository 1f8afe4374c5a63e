#pragma once

#include "device/Bus.h"

#include <gtest/gtest.h>

#include <memory>

/// Connects, and fails the test when that prints anything.
inline std::unique_ptr<device::Bus> connectSilently(const device::Folder& folder) {
    testing::internal::CaptureStderr();
    auto bus = device::Bus::connect(folder);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    return bus;
}
