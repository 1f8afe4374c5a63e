#include "device/Packages.h"

#include "InstalledPackages.h"
#include "support/Message.h"
#include "support/Process.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <random>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>
#include <sys/un.h>

namespace {

using device::PackageEvent;
using support::messageOf;
using support::Process;
using support::readFile;
using support::TemporaryDevice;
using support::writeFile;
using testing::AllOf;
using testing::ElementsAre;
using testing::Field;
using testing::IsEmpty;

using PackageInstallation = InstalledPackages;

auto isEvent(PackageEvent::Type type, PackageEvent::State state, int progress, int error = 0) {
    return AllOf(Field(&PackageEvent::id, "com.example.tea"), Field(&PackageEvent::type, type),
                 Field(&PackageEvent::state, state), Field(&PackageEvent::progress, progress),
                 Field(&PackageEvent::error, error));
}

class PackageEvents : public InstalledPackages {
protected:
    using Type = PackageEvent::Type;
    using State = PackageEvent::State;

    std::vector<PackageEvent> told;
    /// The version that was installed when "completed" or "failed" came.
    std::string versionAtTheEnd = "not told";
    device::Events::Subscription subscription = device->events().onPackage([this](const PackageEvent& event) {
        told.push_back(event);
        if (event.state != State::Completed && event.state != State::Failed)
            return;
        const auto package = packages.find(event.id);
        versionAtTheEnd = package ? package->version : "none";
    });
};

TEST_F(PackageEvents, TellOfAnInstallationWhenItsFilesAreInPlace) {
    packages.install(makePackage("com.example.tea", "1.0"));
    EXPECT_THAT(told,
                ElementsAre(isEvent(Type::Install, State::Started, 0), isEvent(Type::Install, State::Processing, 50),
                            isEvent(Type::Install, State::Completed, 100)));
    EXPECT_EQ(versionAtTheEnd, "1.0");
}

TEST_F(PackageEvents, TellOfAnUpdate) {
    packages.install(makePackage("com.example.tea", "1.0"));
    told.clear();
    packages.install(makePackage("com.example.tea", "2.0"));
    EXPECT_THAT(told,
                ElementsAre(isEvent(Type::Update, State::Started, 0), isEvent(Type::Update, State::Processing, 50),
                            isEvent(Type::Update, State::Completed, 100)));
    EXPECT_EQ(versionAtTheEnd, "2.0");
}

TEST_F(PackageEvents, TellOfARemoval) {
    packages.install(makePackage("com.example.tea"));
    told.clear();
    packages.uninstall("com.example.tea");
    EXPECT_THAT(told, ElementsAre(isEvent(Type::Uninstall, State::Started, 0),
                                  isEvent(Type::Uninstall, State::Processing, 50),
                                  isEvent(Type::Uninstall, State::Completed, 100)));
    EXPECT_EQ(versionAtTheEnd, "none");
}

TEST_F(PackageEvents, TellOfAFailureThatChangedNothing) {
    packages.install(makePackage("com.example.tea", "1.0"));
    told.clear();
    const auto bad = makePackage("com.example.tea", "2.0");
    std::filesystem::create_symlink("/etc/passwd", bad / "link");
    EXPECT_THROW(packages.install(bad), device::Error);
    EXPECT_THAT(told,
                ElementsAre(isEvent(Type::Update, State::Started, 0), isEvent(Type::Update, State::Failed, 0, -EIO)));
    EXPECT_EQ(versionAtTheEnd, "1.0");
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageEvents, AreNoneForWhatIsNoPackage) {
    EXPECT_THROW(packages.install(device.folder()), device::Error);
    EXPECT_THROW(packages.uninstall("com.example.none"), device::Error);
    EXPECT_THAT(told, IsEmpty());
}

class RefusedPackages : public InstalledPackages {
protected:
    std::string messageFor(const std::filesystem::path& folder) const {
        std::string message = messageOf([&] { packages.install(folder); });
        EXPECT_FALSE(packages.find("com.example.tea"));
        return message;
    }
    std::filesystem::path source = makePackage("com.example.tea");
};

TEST_F(RefusedPackages, HoldLinksOrWhatIsNoFile) {
    std::filesystem::create_symlink(source / "tizen-manifest.xml", source / "res/link");
    EXPECT_EQ(messageFor(source), (source / "res/link").string() +
                                      ": is a link; a package holds files and folders only, put the file itself there");
    std::filesystem::remove(source / "res/link");
    std::filesystem::create_directory_symlink("/etc", source / "shared/etc");
    EXPECT_EQ(messageFor(source), (source / "shared/etc").string() +
                                      ": is a link; a package holds files and folders only, put the file itself there");
    std::filesystem::remove(source / "shared/etc");
    ASSERT_EQ(mkfifo((source / "pipe").c_str(), 0600), 0);
    EXPECT_EQ(messageFor(source),
              (source / "pipe").string() + ": is neither a file nor a folder; remove it from the package");
    std::filesystem::remove(source / "pipe");
    if (mknod((source / "node").c_str(), S_IFCHR | 0600, makedev(1, 3)) == 0) {
        EXPECT_EQ(messageFor(source),
                  (source / "node").string() + ": is neither a file nor a folder; remove it from the package");
        std::filesystem::remove(source / "node");
    }
    EXPECT_EQ(packages.install(source).id, "com.example.tea");
}

TEST_F(RefusedPackages, HoldSockets) {
    const int listening = socket(AF_UNIX, SOCK_STREAM, 0);
    sockaddr_un name{};
    name.sun_family = AF_UNIX;
    (source / "socket").string().copy(name.sun_path, sizeof name.sun_path - 1);
    ASSERT_EQ(bind(listening, reinterpret_cast<const sockaddr*>(&name), sizeof name), 0);
    EXPECT_EQ(messageFor(source),
              (source / "socket").string() + ": is neither a file nor a folder; remove it from the package");
    close(listening);
}

TEST_F(RefusedPackages, AreNoFolder) {
    EXPECT_EQ(messageFor(device.folder() / "none"),
              (device.folder() / "none").string() + ": No such file or directory; name the folder of a package");
    EXPECT_EQ(messageFor(source / "tizen-manifest.xml"),
              (source / "tizen-manifest.xml").string() + ": is not a folder; name the folder of a package");
}

TEST_F(RefusedPackages, LieInTheDevicesOwnFolderOrAroundIt) {
    const std::string reason = ": the device's own folder " + device.root().string() +
                               " and the package lie in each other; install from another folder";
    const auto inside = TemporaryDevice::makePackage(device.root() / "inside", "com.example.tea");
    EXPECT_EQ(messageFor(inside), inside.string() + reason);
    std::filesystem::create_directory_symlink(inside, device.folder() / "link");
    EXPECT_EQ(messageFor(device.folder() / "link"), (device.folder() / "link").string() + reason);
    TemporaryDevice::makePackage(device.folder(), "com.example.tea");
    EXPECT_EQ(messageFor(device.folder()), device.folder().string() + reason);
    EXPECT_EQ(messageFor("/"), "/" + reason);
}

TEST_F(RefusedPackages, DoNotFitOnTheDisk) {
    writeFile(source / "large", std::string(2 << 20, 'x'));
    auto installer = Process::ofWork([&] {
        signal(SIGXFSZ, SIG_IGN);
        device::Device same(device.options());
        const rlimit limit{1 << 20, 1 << 20};
        setrlimit(RLIMIT_FSIZE, &limit);
        const std::string message = messageOf([&] { same.packages().install(source); });
        const std::string expected = (source / "large").string() + ": cannot be copied to " +
                                     (device.root() / "opt/usr/apps/.installing-").string();
        const std::string end = "/large: File too large";
        return message.rfind(expected, 0) == 0 && message.size() == expected.size() + 6 + end.size() &&
                       message.substr(expected.size() + 6) == end
                   ? 0
                   : 1;
    });
    EXPECT_EQ(installer.wait(), 0);
    EXPECT_FALSE(packages.find("com.example.tea"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageInstallation, AreWholeAfterAnInstallationIsKilledAtAnyMoment) {
    const auto versions = {makePackage("com.example.tea", "1.0"), makePackage("com.example.tea", "2.0")};
    for (const auto& source : versions)
        for (int number = 0; number < 40; ++number)
            writeFile(source / ("res/" + std::to_string(number)), std::string(20000, 'x'));
    packages.install(*versions.begin());
    std::mt19937 random(4711);
    std::uniform_int_distribution<int> microseconds(0, 15000);
    for (int round = 0; round < 40; ++round) {
        auto installer = Process::ofWork([&] {
            device::Device same(device.options());
            for (;;)
                for (const auto& source : versions)
                    same.packages().install(source);
            return 0;
        });
        // The moment is the point of this test: a real one, at random, while the installer runs.
        usleep(static_cast<useconds_t>(microseconds(random)));
        installer.end(SIGKILL);
        const auto package = packages.find("com.example.tea");
        ASSERT_TRUE(package);
        for (int number = 0; number < 40; ++number)
            ASSERT_EQ(std::filesystem::file_size(package->root / ("res/" + std::to_string(number))), 20000U);
    }
    packages.install(makePackage("com.example.other"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageInstallation, NeedsNoNoteInTheDatabase) {
    packages.uninstall("com.example.app");
    for (const char* change : {"INSERT", "UPDATE", "DELETE"})
        device->database().sql().exec(std::string("CREATE TRIGGER refuse_") + change + " BEFORE " + change +
                                      " ON package BEGIN SELECT RAISE(ABORT, 'no'); END");
    for (const char* version : {"1.0", "2.0"})
        for (const char* id : {"com.example.tea", "com.example.app"})
            EXPECT_EQ(packages.install(makePackage(id, version)).version, version);
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageInstallation, CleansWhatOthersThatWereCutShortHaveLeft) {
    const auto apps = device.root() / "opt/usr/apps";
    TemporaryDevice::makePackage(apps / ".installing-abcdef", "com.example.left");
    TemporaryDevice::makePackage(apps / ".removing-abcdef/com.example.left", "com.example.left");
    EXPECT_FALSE(packages.find("com.example.left"));
    packages.install(makePackage("com.example.tea"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageInstallation, LeavesEveryOtherFolder) {
    const auto apps = device.root() / "opt/usr/apps";
    writeFile(apps / "notes/mine.txt", "mine");
    TemporaryDevice::makePackage(apps / "com.example.hand", "com.example.hand", "0.1");
    packages.install(makePackage("com.example.tea"));
    EXPECT_EQ(readFile(apps / "notes/mine.txt"), "mine");
    EXPECT_THAT(idsOf(packages.all()), ElementsAre("com.example.app", "com.example.hand", "com.example.tea"));
}

TEST_F(PackageInstallation, KeepsWhatWasInstalledBeforeTheDatabaseWasDamaged) {
    const auto tea = makePackage("com.example.tea", "2.0");
    writeFile(tea / "shared/res/tip.xml", "<tip/>");
    packages.install(tea);
    packages.install(makePackage("com.example.app", "4.0"));
    device::Device::setCurrent(nullptr);
    writeFile(device.options().folder.database(), std::string(10000, 'x'));
    ASSERT_THROW(device.reopen(), device::DamagedError);
    device.reopen();

    EXPECT_THAT(idsOf(device->packages().all()), ElementsAre("com.example.app", "com.example.tea"));
    device->packages().install(makePackage("com.example.other"));
    EXPECT_THAT(idsOf(device->packages().all()),
                ElementsAre("com.example.app", "com.example.other", "com.example.tea"));
    EXPECT_EQ(device->packages().find("com.example.app")->version, "4.0");
    EXPECT_EQ(device->packages().find("com.example.tea")->version, "2.0");
    EXPECT_EQ(readFile(device.root() / "opt/usr/apps/com.example.tea/shared/res/tip.xml"), "<tip/>");
}

TEST_F(PackageInstallation, MayBeInstalledByTwoProcessesAtOnce) {
    std::vector<std::filesystem::path> sources;
    sources.reserve(10);
    for (int number = 0; number < 10; ++number)
        sources.push_back(makePackage("com.example.tea", std::to_string(number)));
    const auto installer = [&] {
        return Process::ofWork([&] {
            device::Device same(device.options());
            for (const auto& source : sources)
                same.packages().install(source);
            return 0;
        });
    };
    Process first = installer();
    Process second = installer();
    EXPECT_EQ(first.wait(), 0);
    EXPECT_EQ(second.wait(), 0);
    EXPECT_EQ(packages.find("com.example.tea")->version, "9");
    EXPECT_THAT(remains(), IsEmpty());
}

}  // namespace
