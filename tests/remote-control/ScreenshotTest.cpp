#include "Screenshot.h"

#include "SampleTest.h"
#include "support/FullDisk.h"
#include "support/TemporaryFolder.h"

using remote_control::writeScreenshot;
using support::FullDisk;
using testing::ElementsAre;

namespace {

namespace fs = std::filesystem;

class Screenshot : public SampleTest {
protected:
    fs::path file() const { return folder_.path() / "screen.png"; }
    std::vector<std::string> filesLeft() const {
        std::vector<std::string> names;
        for (const fs::directory_entry& entry : fs::directory_iterator(folder_.path())) {
            names.push_back(entry.path().filename());
        }
        return names;
    }
    /// The pixels of a picture file, as the toolkit loads it.
    test_ui::Picture load(const fs::path& picture) {
        Evas_Object* image = evas_object_image_add(evas_object_evas_get(window()));
        evas_object_image_file_set(image, picture.c_str(), nullptr);
        int width = 0;
        int height = 0;
        evas_object_image_size_get(image, &width, &height);
        const test_ui::Picture loaded(width, height,
                                      static_cast<const unsigned int*>(evas_object_image_data_get(image, EINA_FALSE)));
        evas_object_del(image);
        return loaded;
    }

    support::TemporaryFolder folder_;
};

}  // namespace

TEST_F(Screenshot, HoldsWhatTheWindowShows) {
    const test_ui::Picture shown = screen().picture();

    writeScreenshot(window(), file());

    const test_ui::Picture loaded = load(file());
    EXPECT_EQ(loaded.width(), 720);
    EXPECT_EQ(loaded.height(), 1280);
    EXPECT_GT(loaded.colours({0, 0, 720, 1280}), 2);
    EXPECT_TRUE(loaded == shown) << "every pixel is the same";
    EXPECT_THAT(filesLeft(), ElementsAre("screen.png"));
}

TEST_F(Screenshot, LeavesTheScreenAsItWas) {
    const test_ui::Picture before = screen().picture();

    writeScreenshot(window(), file());

    EXPECT_TRUE(screen().picture() == before);
}

TEST_F(Screenshot, ReplacesAnOlderFile) {
    support::writeFile(file(), "old");

    writeScreenshot(window(), file());

    EXPECT_EQ(support::readFile(file()).substr(1, 3), "PNG");
}

TEST_F(Screenshot, OnAFullDiskTheOlderFileStays) {
    support::writeFile(file(), "old");
    toolkit_.log().expect("Image save failed");
    const FullDisk disk(100);

    EXPECT_EQ(errorOf([this] { writeScreenshot(window(), file()); }),
              "cannot write the picture " + file().string() + ": is the disk full?");

    EXPECT_EQ(support::readFile(file()), "old");
    EXPECT_THAT(filesLeft(), ElementsAre("screen.png"));
}

TEST_F(Screenshot, NeedsAnAbsolutePathThatEndsInPng) {
    EXPECT_EQ(errorOf([this] { writeScreenshot(window(), "a.png"); }),
              "cannot write the picture a.png: its path must be absolute");
    EXPECT_EQ(errorOf([this] { writeScreenshot(window(), "/a.jpg"); }),
              "cannot write the picture /a.jpg: its name must end in .png");
}

TEST_F(Screenshot, NeedsAFolderThatIsThere) {
    const std::string missing = folder_.path() / "none";

    EXPECT_EQ(errorOf([&] { writeScreenshot(window(), missing + "/a.png"); }),
              "cannot write the picture " + missing + "/a.png: " + missing + " is no folder");
}

TEST_F(Screenshot, DoesNotReplaceAFolder) {
    fs::create_directory(file());

    EXPECT_EQ(errorOf([this] { writeScreenshot(window(), file()); }),
              "cannot write the picture " + file().string() + ": it is a folder");
}
