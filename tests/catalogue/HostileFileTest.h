#pragma once

#include "HostileTest.h"

#include <unistd.h>

#include <fstream>

/// Files that are not what they should be.
class HostileFile : public HostileTest {
protected:
    std::filesystem::path detailFile() const { return resources() / tipPath; }
    std::filesystem::path stringFile() const { return resources() / "contents/tip-string.xml"; }

    /// Expects the main menu file to be there and of no use.
    void expectNoMainMenu() {
        EXPECT_THAT(load(), testing::IsEmpty());
        EXPECT_FALSE(result());
        EXPECT_THAT(errors(), testing::ElementsAre(manager_log::error("__loadMainMenu", "Failed to xmlReadFile")));
    }
    /// Expects the tip to keep its place without its texts.
    void expectNoDetail() {
        writeMenus({{}});
        const auto records = load();
        EXPECT_TRUE(result());
        ASSERT_EQ(records.size(), 1U);
        EXPECT_EQ(records[0].menuTitle, "");
        EXPECT_THAT(errors(), testing::ElementsAre(manager_log::error("__loadDetailMenu", "Failed to xmlReadFile")));
        EXPECT_THAT(log(),
                    testing::Contains(manager_log::info("loadContentsList", "__loadDetailMenu failed : " + kest)));
    }
    /// Expects it to keep its place likewise, its file having no document in it.
    void expectEmptyDetail() {
        writeMenus({{}});
        const auto records = load();
        ASSERT_EQ(records.size(), 1U);
        EXPECT_EQ(records[0].menuTitle, "");
        EXPECT_THAT(errors(), testing::ElementsAre(manager_log::error("__loadDetailMenu", "Empty document")));
    }
    /// Expects the tip to do without its string file.
    void expectNoStrings() {
        EXPECT_EQ(loadTip("<title id=\"IDS_MINE\">untranslated</title>").menuTitle, "untranslated");
        EXPECT_THAT(errors(),
                    testing::ElementsAre(manager_log::error("__loadStringResource", "Failed to xmlReadFile")));
        EXPECT_TRUE(result());
    }
    /// Nobody may read the file: not even the superuser, as long as this lives.
    class Unreadable {
    public:
        Unreadable(const support::TemporaryDevice& device, const std::filesystem::path& file) {
            namespace fs = std::filesystem;
            fs::permissions(file, fs::perms::none);
            if (geteuid() == 0) {
                for (const fs::path& folder : {device.folder(), device.root()})
                    fs::permissions(folder, fs::perms::all);
                const fs::path log = device::Folder(device.root()).log();
                std::ofstream(log, std::ios::app).flush();
                fs::permissions(log, fs::perms::all);
                constexpr uid_t nobody = 65534;
                became_ = seteuid(nobody) == 0;
            }
        }
        ~Unreadable() {
            if (became_ && seteuid(0) != 0)
                std::abort();
        }

    private:
        bool became_ = false;
    };
};
