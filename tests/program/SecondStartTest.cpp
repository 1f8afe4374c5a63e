#include "RequestTest.h"

#include "support/Environment.h"
#include "support/Process.h"

#include <csignal>
#include <fcntl.h>
#include <poll.h>

using support::BusClient;
using test_tool::done;
using test_tool::Result;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/// A second start of the program, by hand.
class SecondStart : public WarmRequestTest {
protected:
    support::Process startInBackground(const std::vector<std::string>& words) {
        const support::Environment folder("KEST_DEVICE", device_.root().string());
        const support::Environment home("HOME", device_.folder().string());
        const support::Environment bus("DBUS_SESSION_BUS_ADDRESS", std::nullopt);
        const support::Environment engine("ELM_ENGINE", "buffer");
        return support::Process::ofWork([&] {
            const int file = open(said().c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
            dup2(file, STDOUT_FILENO);
            dup2(file, STDERR_FILENO);
            std::vector<char*> arguments{const_cast<char*>("kest")};
            for (const std::string& word : words) {
                arguments.push_back(const_cast<char*>(word.c_str()));
            }
            arguments.push_back(nullptr);
            execv(KEST_PROGRAM, arguments.data());
            return 127;
        });
    }
    Result startAgain(const std::vector<std::string>& words) {
        const int status = startInBackground(words).wait();
        return {status, support::readFile(said()), ""};
    }
    std::filesystem::path said() const { return device_.folder() / "said"; }
    static Result running() { return {0, "kest: com.ravella.kest is running already\n", ""}; }
};

}  // namespace

TEST_F(SecondStart, HandsItsRequestOver) {
    const pid_t first = device_.application();
    EXPECT_EQ(startAgain({clockTip}), running());
    EXPECT_EQ(device_.run({"wait-for", "view=KestContentView"}), done());
    EXPECT_EQ(device_.application(), first);
    EXPECT_THAT(records(), ElementsAre(recordOf(clockMenu_)));
}

TEST_F(SecondStart, HandsTheRequestOfALinkOver) {
    EXPECT_EQ(startAgain({"kest:com.ravella.clock?page=1"}), running());
    device_.must({"wait-for", "view=KestContentView"});
    expectTipAboveTheList(clockMenu_);
}

TEST_F(SecondStart, WithALinkThatLeadsToNoTipIsRefused) {
    EXPECT_EQ(
        startAgain({"kest:com.ravella.clock?page=abc"}),
        (Result{2,
                "kest: error: cannot open \"kest:com.ravella.clock?page=abc\": its \"page\" is \"abc\", which does "
                "not match [0-9]+; such a link is written kest:{appID}{?page}\n",
                ""}));
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(SecondStart, TakesThePlaceOfTheFirstWhereThatEndsBeforeItsTurn) {
    const pid_t first = device_.application();
    kill(first, SIGSTOP);
    BusClient other(address());
    other.send(target(), "Launch", {BusClient::texts({{"LaunchingType", "addNoti"}})});
    support::Process second = startInBackground({clockTip});
    // Until it waits for the first one's answer; otherwise it only finds less to do.
    poll(nullptr, 0, 1000);
    kill(first, SIGCONT);

    EXPECT_EQ(device_.run({"wait-for", "view=KestContentView", "--app", app}), done()) << support::readFile(said());
    EXPECT_EQ(device_.application(), second.id());
    EXPECT_THAT(records(), ElementsAre(recordOf(clockMenu_)));
}

TEST_F(SecondStart, WithOddExtrasChangesNothing) {
    for (const std::vector<std::string>& extras : std::vector<std::vector<std::string>>{
             {},
             {"appID="},
             {"page="},
             {"appID=" + std::string(60 * 1024, 'x')},
             {clockTip, "page=99999999999999999999"},
             {clockTip, "page=2"},
             {std::string(clockTip) + "\n"},
             {"appID=\"com.ravella.clock\""},
             {"appID='com.ravella.clock'"},
             {"appID=com.ravella.clock=com.ravella.clock"},
             {"a=b=c", "LaunchingType=addnoti"},
             {"AppID=com.ravella.clock"},
             {"appID=%s%n$(reboot)`reboot`"},
         })
        EXPECT_EQ(startAgain(extras), running()) << testing::PrintToString(extras);
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(SecondStart, WithAPageThatIsNoNumberOrLessThanOneShowsTheFirst) {
    for (const char* page : {"page=0", "page=-1", "page=-99999999999999999999", "page=x", "page= 1", "page=1=2"})
        EXPECT_EQ(startAgain({clockTip, page}), running()) << page;
    device_.must({"wait-for", "view=KestContentView"});
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(records(), std::vector<std::string>(6, recordOf(clockMenu_)));
}

TEST_F(SecondStart, WithWhatIsNoTextOrTooMuchIsRefused) {
    EXPECT_EQ(startAgain({"appID=\xff"}), (Result{2, "kest: error: the extra \"appID\" is not UTF-8\n", ""}));
    EXPECT_EQ(startAgain({"appID=" + std::string(70000, 'x')}),
              (Result{2, "kest: error: the request is larger than 64 KiB\n", ""}));
    EXPECT_EQ(startAgain({clockTip, clockTip}), (Result{2, "kest: error: the extra \"appID\" is given twice\n", ""}));
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(records(), IsEmpty());
}
