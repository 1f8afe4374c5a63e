#include "support/Environment.h"
#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <device/Keys.h>
#include <efl-answers/DisplayLanguage.h>
#include <gmock/gmock.h>

#include <dlfcn.h>
#include <locale.h>
#include <string.h>

using test_ui::Rect;

namespace {

class EflAnswers : public test_ui::UiTest {
protected:
    static Rect screenSize() {
        Rect screen;
        elm_win_screen_size_get(nullptr, &screen.x, &screen.y, &screen.width, &screen.height);
        return screen;
    }

    support::TemporaryDevice device_;
};

TEST_F(EflAnswers, AreWhatEflItselfCallsToo) {
    EXPECT_EQ(reinterpret_cast<void*>(elm_win_screen_size_get), dlsym(RTLD_DEFAULT, "elm_win_screen_size_get"));
    EXPECT_EQ(reinterpret_cast<void*>(elm_theme_extension_add), dlsym(RTLD_DEFAULT, "elm_theme_extension_add"));
    EXPECT_EQ(reinterpret_cast<void*>(elm_language_set), dlsym(RTLD_DEFAULT, "elm_language_set"));
    Dl_info where = {};
    ASSERT_NE(0, dladdr(dlsym(RTLD_DEFAULT, "elm_language_set"), &where));
    EXPECT_THAT(where.dli_fname, testing::HasSubstr("efl-answers-tests"));
}

class EflAnswersForPops : public EflAnswers {
protected:
    EflAnswersForPops() {
        elm_win_resize_object_add(window(), naviframe_);
        evas_object_show(naviframe_);
        push();
        second_ = push();
    }

    Elm_Object_Item* push() const {
        return elm_naviframe_item_push(naviframe_, nullptr, nullptr, nullptr, elm_layout_add(naviframe_), nullptr);
    }
    unsigned int items() const {
        Eina_List* all = elm_naviframe_items_get(naviframe_);
        const unsigned int count = eina_list_count(all);
        eina_list_free(all);
        return count;
    }

    Evas_Object* naviframe_ = elm_naviframe_add(window());
    Elm_Object_Item* second_ = nullptr;
};

TEST_F(EflAnswersForPops, APopWhileTheItemMovesInIsCarriedOutWhenItHasArrived) {
    elm_naviframe_item_pop(naviframe_);
    EXPECT_EQ(second_, elm_naviframe_top_item_get(naviframe_));
    test_ui::runFor(1);
    EXPECT_EQ(1u, items());
}

TEST_F(EflAnswersForPops, TwoPopsWhileTheItemMovesInPopItAlone) {
    elm_naviframe_item_pop(naviframe_);
    elm_naviframe_item_pop(naviframe_);
    test_ui::runFor(1);
    EXPECT_EQ(1u, items());
}

TEST_F(EflAnswersForPops, APopOfAnItemThatWasCoveredMeanwhileIsForgotten) {
    elm_naviframe_item_pop(naviframe_);
    Elm_Object_Item* third = push();
    test_ui::runFor(1);
    EXPECT_EQ(third, elm_naviframe_top_item_get(naviframe_));
    EXPECT_EQ(3u, items());
}

TEST_F(EflAnswersForPops, APopAtRestIsCarriedOutAtOnce) {
    test_ui::runFor(1);
    elm_naviframe_item_pop(naviframe_);
    EXPECT_EQ(1u, items());
}

/// Items that do not want to go yet.
class EflAnswersForVetoes : public EflAnswersForPops {
protected:
    EflAnswersForVetoes() {
        elm_naviframe_item_pop_cb_set(second_, asked, this);
        test_ui::runFor(1);
    }

    static Eina_Bool asked(void* self, Elm_Object_Item*) {
        ++static_cast<EflAnswersForVetoes*>(self)->asked_;
        return static_cast<EflAnswersForVetoes*>(self)->allows_;
    }

    int asked_ = 0;
    bool allows_ = false;
};

TEST_F(EflAnswersForVetoes, AnItemThatKeptItselfWhileAnotherMovesOutIsNotAskedAgain) {
    push();
    test_ui::runFor(1);
    elm_naviframe_item_pop(naviframe_);
    elm_naviframe_item_pop(naviframe_);
    EXPECT_EQ(1, asked_);
    allows_ = true;
    test_ui::runFor(1);
    EXPECT_EQ(1, asked_);
    EXPECT_EQ(second_, elm_naviframe_top_item_get(naviframe_));
}

TEST_F(EflAnswersForVetoes, AnItemThatKeptItselfAtRestIsNotAskedByALaterTransition) {
    elm_naviframe_item_pop(naviframe_);
    EXPECT_EQ(1, asked_);
    allows_ = true;
    Elm_Object_Item* third = elm_naviframe_item_insert_after(naviframe_, second_, nullptr, nullptr, nullptr,
                                                             elm_layout_add(naviframe_), nullptr);
    elm_naviframe_item_pop(naviframe_);
    EXPECT_NE(third, elm_naviframe_top_item_get(naviframe_));
    test_ui::runFor(1);
    EXPECT_EQ(1, asked_);
    EXPECT_EQ(second_, elm_naviframe_top_item_get(naviframe_));
}

TEST_F(EflAnswersForVetoes, AnItemIsAskedWhenItHasMovedIn) {
    Elm_Object_Item* third = push();
    elm_naviframe_item_pop_cb_set(third, asked, this);
    elm_naviframe_item_pop(naviframe_);
    EXPECT_EQ(0, asked_);
    test_ui::runFor(1);
    EXPECT_EQ(1, asked_);
    EXPECT_EQ(third, elm_naviframe_top_item_get(naviframe_));
}

TEST_F(EflAnswersForVetoes, AnItemWhoseCallbackWasTakenAwayGoes) {
    elm_naviframe_item_pop_cb_set(second_, nullptr, nullptr);
    elm_naviframe_item_pop(naviframe_);
    EXPECT_EQ(1u, items());
    EXPECT_EQ(0, asked_);
}

TEST_F(EflAnswersForVetoes, AnItemThatKeptItselfGoesWhenItIsAskedAgain) {
    elm_naviframe_item_pop(naviframe_);
    allows_ = true;
    elm_naviframe_item_pop(naviframe_);
    EXPECT_EQ(1u, items());
}

TEST_F(EflAnswers, TheScreenIsTheDevicesWhateverShowsIt) {
    EXPECT_EQ((Rect{0, 0, 720, 1280}), screenSize());
    elm_win_screen_size_get(window(), nullptr, nullptr, nullptr, nullptr);
}

TEST_F(EflAnswers, TheScreenIsTheSmallOneOnADeviceThatHasThat) {
    device_->settings().set(device::keys::screen, "480x800");
    EXPECT_EQ((Rect{0, 0, 480, 800}), screenSize());
}

TEST_F(EflAnswers, AThemeFileIsAddedOnce) {
    const auto count = [] { return eina_list_count(elm_theme_extension_list_get(nullptr)); };
    const std::string file = "/usr/share/elementary/themes/default.edj";
    elm_theme_extension_add(nullptr, file.c_str());
    elm_theme_extension_add(nullptr, file.c_str());
    elm_theme_extension_add(nullptr, nullptr);
    EXPECT_EQ(1u, count());
    EXPECT_EQ(file, static_cast<const char*>(eina_list_data_get(elm_theme_extension_list_get(nullptr))));
    const auto other = device_.folder() / "other.edj";
    std::filesystem::copy_file(file, other);
    elm_theme_extension_add(nullptr, other.c_str());
    EXPECT_EQ(2u, count());

    Elm_Theme* own = elm_theme_new();
    elm_theme_extension_add(own, file.c_str());
    EXPECT_EQ(1u, eina_list_count(elm_theme_extension_list_get(own)));
    elm_theme_free(own);
}

/// A list whose rows are as wide as itself, scrolled to the middle.
class EflAnswersForLists : public EflAnswers {
protected:
    EflAnswersForLists() {
        style_->item_style = "default";
        style_->func.text_get = [](void*, Evas_Object*, const char*) { return strdup("a row"); };
        elm_genlist_mode_set(list_, ELM_LIST_COMPRESS);
        elm_genlist_homogeneous_set(list_, EINA_TRUE);
        for (int i = 0; i < 100; ++i)
            rows_.push_back(
                elm_genlist_item_append(list_, style_, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr));
        evas_object_resize(list_, 720, 600);
        evas_object_show(list_);
        test_ui::runFor(0.5);
        elm_genlist_item_show(rows_[50], ELM_GENLIST_ITEM_SCROLLTO_TOP);
        test_ui::runFor(0.5);
    }
    ~EflAnswersForLists() override { elm_genlist_item_class_free(style_); }

    void expectRows() {
        EXPECT_EQ(0, test_ui::rowGeometry(rows_[50]).y);
        EXPECT_EQ(720, test_ui::rowGeometry(rows_[50]).width);
    }

    Evas_Object* list_ = elm_genlist_add(window());
    Elm_Genlist_Item_Class* style_ = elm_genlist_item_class_new();
    std::vector<Elm_Object_Item*> rows_;
};

TEST_F(EflAnswersForLists, AListKeepsItsRowsAndItsPlaceWhenItIsMirrored) {
    expectRows();
    for (const bool mirrored : {true, false, true}) {
        elm_config_mirrored_set(mirrored);
        test_ui::runFor(0.5);
        expectRows();
    }
}

TEST_F(EflAnswersForLists, AListMayGoRightAfterItWasMirrored) {
    elm_config_mirrored_set(EINA_TRUE);
    evas_object_del(list_);
    test_ui::runFor(0.5);
    EXPECT_THAT(toolkit_.log().lines(), testing::IsEmpty());
}

class EflLanguage : public EflAnswers {
protected:
    EflLanguage() {
        DisplayLanguage::bindTexts("drinks", TEST_TEXTS);
        label_ = elm_label_add(window());
        elm_object_domain_translatable_text_set(label_, "drinks", "IDS_TEA");
        evas_object_smart_callback_add(
            label_, "language,changed", [](void* changes, Evas_Object*, void*) { ++*static_cast<int*>(changes); },
            &changes_);
    }

    Evas_Object* label_;
    int changes_ = 0;
};

TEST_F(EflLanguage, ChangesTextsOnScreenOnAWorkstationWithoutItsLocale) {
    elm_language_set("ru_RU");
    EXPECT_EQ("Чай", test_ui::text(label_));
    elm_language_set("ko_KR.EUC-KR");
    EXPECT_EQ("차", test_ui::text(label_));
    EXPECT_STREQ("ko_KR", std::getenv("LANGUAGE"));
    EXPECT_STRNE("C", setlocale(LC_MESSAGES, nullptr));
    elm_language_set("C");
    EXPECT_EQ("IDS_TEA", test_ui::text(label_));
    EXPECT_EQ(3, changes_);
}

TEST_F(EflLanguage, WithoutANameTranslatesAnewInTheLanguageThatIs) {
    elm_language_set("ru_RU");
    elm_language_set(nullptr);
    EXPECT_EQ("Чай", test_ui::text(label_));
    EXPECT_STREQ("ru_RU", std::getenv("LANGUAGE"));
    EXPECT_EQ(2, changes_);
}

class EflTitle : public EflLanguage {
protected:
    EflTitle() {
        naviframe_ = elm_naviframe_add(window());
        item_ = elm_naviframe_item_push(naviframe_, nullptr, nullptr, nullptr, elm_layout_add(naviframe_), nullptr);
    }
    void setTitle(const char* text) {
        elm_object_item_domain_translatable_part_text_set(item_, "elm.text.title", "drinks", text);
    }
    std::string title() const { return test_ui::itemText(item_, "elm.text.title"); }

    Evas_Object* naviframe_;
    Elm_Object_Item* item_;
};

TEST_F(EflTitle, ThatIsNoIdIsShownAsItIs) {
    for (const char* text : {"2/11", "3/11", "3/11", "%d of %s", "11/11"}) {
        setTitle(text);
        EXPECT_EQ(text, title());
    }
}

TEST_F(EflTitle, ThatIsNoIdStaysInALanguageChangeAndOneThatIsFollowsIt) {
    setTitle("2/11");
    elm_language_set("ru_RU");
    EXPECT_EQ("2/11", title());
    setTitle("IDS_TEA");
    EXPECT_EQ("Чай", title());
    elm_language_set("ko_KR");
    EXPECT_EQ("차", title());
    setTitle("1/11");
    elm_language_set("ru_RU");
    EXPECT_EQ("1/11", title());
}

}  // namespace
