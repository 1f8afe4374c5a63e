#pragma once

#include "FakeDaemon.h"
#include "device/Keys.h"
#include "support/PrivateBus.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

/// A device on a desktop of the test's own, and an application com.example.tea on it whose program a test writes.
class DesktopTest : public testing::Test {
protected:
    static constexpr char tea[] = "com.example.tea";

    DesktopTest() {
        device_.addPackage(tea);
        std::filesystem::copy(TEST_TEXTS, device_.appRoot() / "res/locale", std::filesystem::copy_options::recursive);
        setProgram("exit 0\n");
    }

    void setProgram(const std::string& script) const {
        const auto program = device_.preinstalled() / tea / "bin/app";
        support::writeFile(program, "#!/bin/sh\n" + script);
        std::filesystem::permissions(program, std::filesystem::perms::owner_all);
    }
    static device::Notification sample() {
        device::Notification notification;
        notification.appId = "com.example.app";
        notification.title = {"Tea", "IDS_TEA"};
        notification.content = {"It is <b>ready</b> & hot.", "IDS_READY"};
        notification.launchAppId = tea;
        notification.launchExtras = {{"page", "walk"}};
        return notification;
    }
    long long post(const device::Notification& notification = sample()) const {
        return device_->notifications().append(notification);
    }
    std::vector<long long> kept() const {
        std::vector<long long> ids;
        for (const device::Notification& notification : device_->notifications().all())
            ids.push_back(notification.id);
        return ids;
    }
    void setLanguage(const std::string& language) const { device_->settings().set(device::keys::language, language); }
    static std::string line(long long id, const std::string& text, char level = 'I') {
        return std::string(1, level) + " NOTIFICATION notification " + std::to_string(id) + ": " + text;
    }

    support::PrivateBus session_;
    support::TemporaryDevice device_;
};
