#pragma once

#include "device/Device.h"
#include "device/Faults.h"
#include "support/TemporaryFolder.h"

#include <filesystem>
#include <memory>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace support {

/// The process's device for one test: a fresh one in a temporary folder, with one pre-installed package, whose
/// application is the one of this process. It and all planned faults go when it is destroyed.
class TemporaryDevice {
public:
    explicit TemporaryDevice(std::string appId = "com.example.app", const std::string& version = "1.0.0")
        : appId_(std::move(appId)) {
        std::filesystem::create_directories(preinstalled());
        std::filesystem::create_directories(data());
        addPackage(appId_, version);
        open();
    }
    ~TemporaryDevice() {
        device::Device::setCurrent(nullptr);
        device::faults::clear();
    }
    TemporaryDevice(const TemporaryDevice&) = delete;
    TemporaryDevice& operator=(const TemporaryDevice&) = delete;

    device::Device& device() const { return device::Device::current(); }
    device::Device* operator->() const { return &device(); }

    /// Opens the device anew, as a process that starts does.
    void reopen() {
        device::Device::setCurrent(nullptr);
        open();
    }

    /// What the device was opened with; for a second process or a second Device on the same folder.
    device::Device::Options options(device::Database::Check check = device::Database::Check::Quick) const {
        return {device::Folder(root()), {preinstalled()}, data(), check};
    }

    /// The test's own folder; it holds all the others.
    const std::filesystem::path& folder() const { return folder_.path(); }
    /// The device's folder.
    std::filesystem::path root() const { return folder() / "device"; }
    /// Where the packages lie that the device has from the start.
    std::filesystem::path preinstalled() const { return folder() / "apps"; }
    /// The platform's own data (locale/, the theme); empty at first.
    std::filesystem::path data() const { return folder() / "data"; }
    /// The folder of this process's application.
    std::filesystem::path appRoot() const { return preinstalled() / appId_; }
    const std::string& appId() const { return appId_; }

    /// Makes a package with a manifest, an icon name "icon.png" and an empty shared/res/, and returns its folder.
    /// Below preinstalled() the device has it at once; a package elsewhere can be installed.
    std::filesystem::path addPackage(const std::string& id, const std::string& version = "1.0.0") const {
        return makePackage(preinstalled() / id, id, version);
    }
    static std::filesystem::path makePackage(const std::filesystem::path& where, const std::string& id,
                                             const std::string& version = "1.0.0") {
        std::filesystem::create_directories(where / "res");
        std::filesystem::create_directories(where / "shared/res");
        writeFile(where / "tizen-manifest.xml",
                  "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                  "<manifest xmlns=\"http://tizen.org/ns/packages\" api-version=\"2.4\" package=\"" +
                      id + "\" version=\"" + version + "\">\n    <ui-application appid=\"" + id +
                      "\" exec=\"app\" type=\"capp\">\n        <icon>icon.png</icon>\n        <label>Label of " + id +
                      "</label>\n    </ui-application>\n</manifest>\n");
        return where;
    }

    /// The lines of the device's log, whole.
    std::vector<std::string> logLines() const {
        std::istringstream stream(readFile(device::Folder(root()).log()));
        std::vector<std::string> lines;
        for (std::string line; std::getline(stream, line);)
            lines.push_back(line);
        return lines;
    }
    /// The same without time and process: "E KEST message".
    std::vector<std::string> logMessages() const {
        std::vector<std::string> messages;
        constexpr std::size_t timeLength = sizeof("2026-01-31 12:00:00.123");
        for (const std::string& line : logLines()) {
            const auto open = line.find('(', timeLength);
            const auto close = line.find(") ", timeLength);
            messages.push_back(line.substr(timeLength, open - timeLength) + line.substr(close + 1));
        }
        return messages;
    }

private:
    void open() {
        device::Device::setCurrent(std::make_unique<device::Device>(options()));
        device::Device::current().setApplication({appId_, appRoot()});
    }

    TemporaryFolder folder_;
    std::string appId_;
};

}  // namespace support
