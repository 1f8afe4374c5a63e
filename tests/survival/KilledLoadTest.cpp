#include "KestContentMgr.h"

#include "kest/CatalogueFiles.h"
#include "kest/Texts.h"
#include "support/TemporaryDevice.h"

#include <device/Keys.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <functional>
#include <random>
#include <set>
#include <sstream>
#include <string>
#include <thread>

#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

constexpr int menuCount = 15;
constexpr int kills = 100;

using Clock = std::chrono::steady_clock;

/// A child process that writes to its parent through a pipe.
class Child {
public:
    explicit Child(const std::function<void(int pipe)>& work) {
        int ends[2];
        if (pipe(ends) != 0)
            throw std::runtime_error("no pipe");
        process_ = fork();
        if (process_ == 0) {
            close(ends[0]);
            work(ends[1]);
            _exit(0);
        }
        close(ends[1]);
        pipe_ = ends[0];
    }
    ~Child() {
        close(pipe_);
        if (process_ > 0)
            wait();
    }
    Child(const Child&) = delete;
    Child& operator=(const Child&) = delete;

    /// Until the child has written something, or has ended.
    void waitForFirstByte() const {
        char byte = 0;
        [[maybe_unused]] const ssize_t got = read(pipe_, &byte, 1);
    }
    std::string readAll() const {
        std::string all;
        char buffer[4096];
        for (ssize_t got = 0; (got = read(pipe_, buffer, sizeof buffer)) > 0;)
            all.append(buffer, static_cast<std::size_t>(got));
        return all;
    }
    void kill() const { ::kill(process_, SIGKILL); }
    /// The status as waitpid() gives it.
    int wait() {
        int status = 0;
        waitpid(process_, &status, 0);
        process_ = -1;
        return status;
    }

private:
    pid_t process_ = -1;
    int pipe_ = -1;
};

class KilledLoad : public testing::Test {
protected:
    KilledLoad() : device_("com.ravella.kest", "1.0.0") {
        std::vector<kest_files::Menu> menus;
        for (int menu = 0; menu < menuCount; ++menu)
            menus.push_back({pathOf(menu), "com.ravella.kest", "Global"});
        support::writeFile(resources() / "contents/kest_menu.xml", kest_files::mainMenu(menus));
        // A connection must not be shared with the children.
        device::Device::setCurrent(nullptr);
    }

    /// Every tip of a round is titled with the round's number.
    void writeRound(int round) const {
        for (int menu = 0; menu < menuCount; ++menu)
            support::writeFile(
                resources() / pathOf(menu),
                kest_files::detail("<title>" + std::to_string(round) + "</title>\n" + kest_files::contents("A text.")));
    }

    /// What a process that starts now has for its titles.
    std::string titlesOfAStart() const {
        Child child([this](int pipe) {
            openDevice();
            std::ostringstream titles;
            for (const KestContentInfo& record : KestContentMgr::getInstance()->getContentsList())
                titles << record.menuTitle << ' ';
            [[maybe_unused]] const ssize_t written = write(pipe, titles.str().data(), titles.str().size());
        });
        std::string titles = child.readAll();
        EXPECT_EQ(0, child.wait());
        return titles;
    }

    /// Kills a process so long after it has begun a full load; true when it was still at it.
    bool killFullLoadAfter(Clock::duration delay) const {
        Child child = processInFullLoad();
        child.waitForFirstByte();
        std::this_thread::sleep_for(delay);
        child.kill();
        return WIFSIGNALED(child.wait());
    }

    Clock::duration timeOfFullLoad() const {
        Child child = processInFullLoad();
        child.waitForFirstByte();
        const auto start = Clock::now();
        child.wait();
        return Clock::now() - start;
    }

private:
    /// One that writes a byte and begins a full load.
    Child processInFullLoad() const {
        return Child([this](int pipe) {
            openDevice();
            KestContentMgr* manager = KestContentMgr::getInstance();
            [[maybe_unused]] const ssize_t written = write(pipe, "!", 1);
            manager->loadContentsList(true);
        });
    }

    static std::string pathOf(int menu) { return "contents/tip" + std::to_string(menu) + ".xml"; }
    std::filesystem::path resources() const { return device_.appRoot() / "shared/res"; }
    void openDevice() const {
        device::Device::setCurrent(std::make_unique<device::Device>(device_.options()));
        device::Device::current().setApplication({device_.appId(), device_.appRoot()});
        kest_texts::start(device::keys::defaultLanguage);
    }

    support::TemporaryDevice device_;
};

TEST_F(KilledLoad, LeavesACacheThatIsWholeOrRebuilt) {
    writeRound(0);
    ASSERT_EQ(std::string(menuCount * 2, ' ').size(), titlesOfAStart().size());

    const unsigned seed = std::random_device{}();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    // Follows how long a load takes on this machine at this moment, so that kills fall everywhere into it.
    Clock::duration longestDelay = timeOfFullLoad();
    int killed = 0;
    int rebuilt = 0;
    for (int round = 1; killed < kills; ++round) {
        ASSERT_LT(round, kills * 20) << "only " << killed << " loads were killed before they ended";
        writeRound(round);
        std::uniform_int_distribution<Clock::rep> delay(0, longestDelay.count());
        const bool inTheMiddle = killFullLoadAfter(Clock::duration(delay(random)));
        killed += inTheMiddle;
        longestDelay = inTheMiddle ? longestDelay * 51 / 50 : longestDelay * 9 / 10;

        std::istringstream titles(titlesOfAStart());
        const std::multiset<int> rounds((std::istream_iterator<int>(titles)), {});
        ASSERT_EQ(menuCount, static_cast<int>(rounds.size())) << "round " << round;
        ASSERT_EQ(*rounds.begin(), *rounds.rbegin()) << "titles of two loads stand in one catalogue, round " << round;
        rebuilt += inTheMiddle && *rounds.begin() == round;
    }
    // Otherwise no kill fell between the old cache and the new.
    EXPECT_GT(rebuilt, 0);
}

}  // namespace
