#include "ProgramTest.h"

#include <fstream>
#include <utility>

using testing::ElementsAre;
using testing::StartsWith;

namespace {

/// As a shell takes it apart: at the blanks that no double quotes hold.
std::vector<std::string> wordsOf(const std::string& line) {
    std::vector<std::string> words;
    std::string word;
    bool quoted = false;
    for (const char character : line + ' ') {
        if (character == '"')
            quoted = !quoted;
        else if (character != ' ' || quoted)
            word += character;
        else if (!word.empty())
            words.push_back(std::exchange(word, {}));
    }
    return words;
}

/// The commands that the README proposes, in their order.
std::vector<std::vector<std::string>> proposed() {
    const std::string prompt = "    build/dev/bin/kest-device ";
    std::vector<std::vector<std::string>> commands;
    std::ifstream readme(README);
    for (std::string line; std::getline(readme, line);)
        if (line.starts_with(prompt))
            commands.push_back(wordsOf(line.substr(prompt.size(), line.find("# ") - prompt.size())));
    return commands;
}

class Readme : public ProgramTest, public testing::WithParamInterface<const char*> {};

}  // namespace

TEST_P(Readme, ProposesWhatWorksOnEitherScreen) {
    device_.must({"start", "--headless", "--screen", GetParam()});
    std::vector<std::string> titles;
    for (const std::vector<std::string>& command : proposed()) {
        device_.must(command);
        if (command.front() == "swipe" || command.front() == "key" || command.front() == "wait-for")
            titles.push_back(titleBar());
    }

    // Scrolled, in Clock, back from there, on the next page, back on the list, and there again after a request.
    EXPECT_THAT(titles, ElementsAre(StartsWith("Tips 2/"), "Clock", StartsWith("Tips 2/"), StartsWith("Tips 3/"),
                                    "Tips", "Tips"));
    EXPECT_TRUE(std::filesystem::exists(device_.folder() / "list.png"));
    EXPECT_THAT(device_.processes(), testing::IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(OnScreens, Readme, testing::Values("720x1280", "480x800"),
                         [](const auto& screen) { return std::string("Of") + screen.param; });
