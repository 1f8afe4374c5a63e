#include "Element.h"
#include "TreeJson.h"
#include "ui/UiTest.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <functional>

using nlohmann::json;

namespace {

/// A pager of three pages; the first one has a picture with a mark over it, and a smaller pager in it.
class ScreenWithPages : public test_ui::UiTest {
protected:
    void SetUp() override {
        pager_ = addPager(window(), 1);
        evas_object_resize(pager_, 720, 1280);
        evas_object_show(pager_);
        Evas_Object* box = elm_object_content_get(pager_);
        for (Evas_Object*& page : pages_)
            elm_box_pack_end(box, page = addPage(box));
        addPicture("picture");
        addPicture("mark");
        test_ui::runFor(1);
    }

    static Evas_Object* addPager(Evas_Object* parent, double pageWidth) {
        Evas_Object* pager = elm_scroller_add(parent);
        elm_scroller_page_relative_set(pager, pageWidth, 0);
        Evas_Object* box = elm_box_add(pager);
        elm_box_horizontal_set(box, EINA_TRUE);
        elm_object_content_set(pager, box);
        return pager;
    }
    static Evas_Object* addPage(Evas_Object* parent) {
        Evas_Object* page = elm_layout_add(parent);
        elm_layout_file_set(page, PAGE_THEME, "page");
        evas_object_size_hint_min_set(page, 720, 1200);
        evas_object_show(page);
        return page;
    }
    void addPicture(const char* part) {
        Evas_Object* image = elm_image_add(pages_[0]);
        elm_image_file_set(image, PICTURE, nullptr);
        elm_object_part_content_set(pages_[0], part, image);
    }
    void signal(const char* name) {
        elm_layout_signal_emit(pages_[0], name, "");
        test_ui::runFor(0.1);
    }

    /// The first thing in the screen's tree, from its root on, that `matches`.
    json find(const std::function<bool(const json&)>& matches) {
        return findIn(json::parse(remote_control::treeOf(window()))["elements"], matches);
    }
    static json findIn(const json& elements, const std::function<bool(const json&)>& matches) {
        for (const json& element : elements) {
            if (matches(element))
                return element;
            if (json below = findIn(element.value("children", json::array()), matches); !below.is_null())
                return below;
        }
        return nullptr;
    }
    json contentOf(const std::string& part) {
        return find([&](const json& element) { return element.value("part", "") == part; });
    }
    /// "STATE", and "STATE hidden" for what is out of sight.
    std::string lookOf(const std::string& part) {
        const json page = find([](const json& element) { return element.value("group", "") == "page"; });
        for (const json& entry : page["parts"])
            if (entry["part"] == part)
                return entry["state"].get<std::string>() + (entry["visible"] ? "" : " hidden");
        return "none";
    }
    json pager() {
        return find([](const json& element) { return element.contains("page"); });
    }

    Evas_Object* pager_ = nullptr;
    Evas_Object* pages_[3] = {};
};

}  // namespace

TEST_F(ScreenWithPages, TellsThePageInView) {
    EXPECT_EQ(pager()["type"], "Elm_Scroller");
    EXPECT_EQ(pager()["page"], 1);
    EXPECT_EQ(pager()["pages"], 3);
    elm_scroller_page_bring_in(pager_, 2, 0);
    test_ui::runFor(1);
    EXPECT_EQ(pager()["page"], 3);
}

TEST_F(ScreenWithPages, TellsNoPageOfAScrollerWithoutPages) {
    Evas_Object* scroller = elm_scroller_add(pages_[0]);
    elm_object_content_set(scroller, addPage(scroller));
    elm_object_part_content_set(pages_[0], "picture", scroller);
    test_ui::runFor(1);
    EXPECT_EQ(contentOf("picture")["type"], "Elm_Scroller");
    EXPECT_FALSE(contentOf("picture").contains("page"));
    EXPECT_FALSE(contentOf("picture").contains("pages"));
}

TEST_F(ScreenWithPages, TellsThePageOfAPagerWithinAPage) {
    Evas_Object* inner = addPager(pages_[0], 1);
    for (int number = 0; number < 5; ++number)
        elm_box_pack_end(elm_object_content_get(inner), addPage(inner));
    elm_object_part_content_set(pages_[0], "picture", inner);
    evas_object_show(inner);
    test_ui::runFor(1);
    elm_scroller_page_show(inner, 3, 0);
    test_ui::runFor(1);
    EXPECT_EQ(pager()["page"], 1);
    EXPECT_EQ(contentOf("picture")["page"], 4);
    EXPECT_EQ(contentOf("picture")["pages"], 5);
}

TEST_F(ScreenWithPages, TellsThePageOfAPagerFromTopToBottom) {
    Evas_Object* inner = elm_scroller_add(pages_[0]);
    elm_scroller_page_relative_set(inner, 0, 1);
    Evas_Object* tall = addPage(inner);
    elm_object_content_set(inner, tall);
    elm_object_part_content_set(pages_[0], "picture", inner);
    test_ui::runFor(1);
    int height = 0;
    evas_object_geometry_get(inner, nullptr, nullptr, nullptr, &height);
    evas_object_size_hint_min_set(tall, 100, 4 * height);
    test_ui::runFor(1);
    elm_scroller_page_show(inner, 0, 2);
    test_ui::runFor(1);
    EXPECT_EQ(contentOf("picture")["page"], 3);
    EXPECT_EQ(contentOf("picture")["pages"], 4);
}

TEST_F(ScreenWithPages, TellsAPicturesFileAndThePartThatItIsIn) {
    EXPECT_EQ(contentOf("picture")["type"], "Elm_Image");
    EXPECT_EQ(contentOf("picture")["file"], PICTURE);
    EXPECT_EQ(contentOf("picture")["visible"], true);
}

TEST_F(ScreenWithPages, TellsWhetherAMarkShows) {
    EXPECT_EQ(lookOf("mark"), "default hidden");
    EXPECT_EQ(contentOf("mark")["visible"], false);
    signal("mark,show");
    EXPECT_EQ(lookOf("mark"), "shown");
    EXPECT_EQ(contentOf("mark")["visible"], true);
    elm_scroller_page_show(pager_, 1, 0);
    test_ui::runFor(1);
    EXPECT_EQ(lookOf("mark"), "shown hidden") << "its page is out of sight";
    elm_scroller_page_show(pager_, 0, 0);
    signal("mark,hide");
    EXPECT_EQ(lookOf("mark"), "default hidden");
}

TEST_F(ScreenWithPages, TellsWhetherWhatCutsAPartShowsIt) {
    EXPECT_EQ(lookOf("button"), "default hidden");
    signal("button,show");
    EXPECT_EQ(lookOf("button"), "default");
    signal("button,press");
    EXPECT_EQ(lookOf("button"), "pressed");
}

TEST_F(ScreenWithPages, TellsNoLooksOfTextsAndOfPartsThatHaveOne) {
    EXPECT_EQ(lookOf("name"), "none");
    EXPECT_EQ(lookOf("picture"), "none");
}
