#include "ListTest.h"

#include "KestContentMgr.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

/// The list has records of its own: that the catalogue was loaded anew is nothing to it until it takes them over.
class OwnCopy : public ListTest {
protected:
    void startWith(const std::vector<std::string>& titles) {
        writeTips(titles);
        start();
        newLog();
    }
    void reloadTheCatalogueAlone() {
        KestContentMgr::getInstance()->loadContentsList(true);
        newLog();
    }
    void drawRowsAnew() {
        elm_genlist_realized_items_update(list());
        settle();
    }
};

TEST_F(OwnCopy, IsWhatTheRowsShow) {
    startWith({"A", "B"});
    writeTips({"X"});
    reloadTheCatalogueAlone();
    drawRowsAnew();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A"), Pair("Name of B", "B")));
}

TEST_F(OwnCopy, IsWhoseIconsTheRowsShow) {
    startWith({"A"});
    writeMenus({{"contents/fallback.xml", ""}});
    reloadTheCatalogueAlone();
    ASSERT_EQ(KestContentMgr::getInstance()->getContentsList().at(0).iconPath, "");
    drawRowsAnew();
    EXPECT_NE(elm_object_item_part_content_get(menuRow(0), "elm.icon.1"), nullptr);
}

TEST_F(OwnCopy, IsWhatATapWritesDown) {
    startWith({"A", "B", "C"});
    writeTips({"X"});
    reloadTheCatalogueAlone();
    openPager(0);
    screen().key("XF86Back");
    settle();
    openPager(2);
    EXPECT_THAT(usageExtras(), ElementsAre("A", "C"));
    EXPECT_THAT(newErrors(), IsEmpty());
}
