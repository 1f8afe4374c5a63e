#pragma once

#include "device/Device.h"
#include "support/TemporaryFolder.h"

#include <filesystem>
#include <map>
#include <nlohmann/json.hpp>
#include <optional>
#include <ostream>
#include <string>
#include <sys/types.h>
#include <vector>

namespace test_tool {

/// What a run of kest-device came to.
struct Result {
    int status = 0;
    std::string out;
    std::string err;

    bool operator==(const Result&) const = default;
};
std::ostream& operator<<(std::ostream& stream, const Result& result);

/// Done, with nothing to say or with this output.
Result done(const std::string& out = "");
/// Not done, with this message.
Result failed(const std::string& message);
/// Not understood, with this message.
Result wrongUsage(const std::string& message);

/// A run of kest-device that goes on meanwhile. Ended when destroyed.
class BackgroundRun {
public:
    BackgroundRun(pid_t process, std::filesystem::path out) : process_(process), out_(std::move(out)) {}
    ~BackgroundRun();
    BackgroundRun(const BackgroundRun&) = delete;
    BackgroundRun& operator=(const BackgroundRun&) = delete;

    std::string out() const { return support::readFile(out_); }
    /// Whether its output is that within ten seconds.
    bool outBecomes(const std::string& text) const;

private:
    pid_t process_;
    std::filesystem::path out_;
};

/// A device of the test's own, and kest-device on it, in an environment with no display and no session bus. When it
/// is destroyed, everything that runs on the device is ended and the folder removed.
class TestDevice {
public:
    TestDevice();
    ~TestDevice();
    TestDevice(const TestDevice&) = delete;
    TestDevice& operator=(const TestDevice&) = delete;

    /// Runs kest-device with these words.
    Result run(const std::vector<std::string>& words);
    /// The same, with an output that nobody reads. The status is a shell's: 141 when that ended the command.
    Result runUnread(const std::vector<std::string>& words);
    /// The same as run(), and fails the test when it was not done. Returns the output.
    std::string must(const std::vector<std::string>& words);
    /// What a command with --json prints.
    nlohmann::json json(const std::vector<std::string>& words);
    /// The same, and notes in `trace` every file that it, and what it starts, opens: as strace writes it, until the
    /// last of them ends. Not possible where processes may not be traced.
    Result runTraced(const std::vector<std::string>& words, const std::filesystem::path& trace);
    BackgroundRun runInBackground(const std::vector<std::string>& words);

    /// Changes the environment of the runs from now on; nullopt takes the variable away.
    void setEnvironment(const std::string& name, const std::optional<std::string>& value);
    /// Puts the device elsewhere: below folder(), or anywhere if absolute.
    void setRoot(const std::filesystem::path& root);

    /// The folder of the device, and the test's own folder around it.
    const std::filesystem::path& root() const { return root_; }
    const std::filesystem::path& folder() const { return folder_.path(); }

    /// The same device, opened in this process.
    device::Device open() const;
    /// The processes that run on the device now.
    std::vector<pid_t> processes() const;
    /// The one that runs, by the tool's word.
    pid_t application();

private:
    pid_t spawn(const std::vector<std::string>& command, const std::filesystem::path& out,
                const std::filesystem::path& err);
    Result runCommand(const std::vector<std::string>& command);

    support::TemporaryFolder folder_;
    std::filesystem::path root_;
    std::map<std::string, std::string> environment_;
    int runs_ = 0;
};

/// A tizen-manifest.xml and an empty shared/res/ in `where`.
std::filesystem::path makePackage(const std::filesystem::path& where, const std::string& id,
                                  const std::string& version);

}  // namespace test_tool
