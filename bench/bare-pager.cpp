// The least that an EFL program does to show the same: a list with an icon and a text each row, and behind each row a
// scroller with all pages side by side, the chosen one filled at once and the others one after the other later on.
// Argument: a file with the pages. What the application's pager is compared with.

#include "BarePage.h"
#include "Pages.h"

#include <Efreet.h>
#include <Elementary.h>

#include <cstring>
#include <exception>
#include <string>
#include <unistd.h>
#include <vector>

namespace {

constexpr int width = 720;
constexpr int height = 1280;
constexpr double secondsToOtherPages = 0.4;

class BarePager {
public:
    explicit BarePager(std::vector<bench::Page> pages) : pages_(std::move(pages)) {}

    bool show() {
        Evas_Object* window = elm_win_util_standard_add("bare-pager", "Bare pager");
        if (!window) {
            return false;
        }
        naviframe_ = elm_naviframe_add(window);
        evas_object_size_hint_weight_set(naviframe_, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        elm_win_resize_object_add(window, naviframe_);
        elm_naviframe_item_push(naviframe_, "Pages", nullptr, nullptr, makeList(), nullptr);
        evas_object_show(naviframe_);
        evas_object_resize(window, width, height);
        evas_object_show(window);
        return true;
    }

private:
    struct Row {
        BarePager* pager;
        size_t index;
    };

    Evas_Object* makeList() {
        Evas_Object* list = elm_genlist_add(naviframe_);
        static Elm_Genlist_Item_Class style;
        style.version = ELM_GENLIST_ITEM_CLASS_VERSION;
        style.item_style = "default";
        style.func.text_get = rowText;
        style.func.content_get = rowIcon;
        rows_.reserve(pages_.size());
        for (size_t i = 0; i < pages_.size(); ++i) {
            rows_.push_back({this, i});
            elm_genlist_item_append(list, &style, &rows_.back(), nullptr, ELM_GENLIST_ITEM_NONE, rowChosen,
                                    &rows_.back());
        }
        return list;
    }

    static char* rowText(void* row, Evas_Object*, const char* part) {
        const auto* self = static_cast<Row*>(row);
        return std::strcmp(part, "elm.text") == 0 ? strdup(self->pager->pages_[self->index].title.c_str()) : nullptr;
    }

    static Evas_Object* rowIcon(void* row, Evas_Object* list, const char* part) {
        if (std::strcmp(part, "elm.swallow.icon") != 0) {
            return nullptr;
        }
        const auto* self = static_cast<Row*>(row);
        Evas_Object* image = elm_image_add(list);
        elm_image_file_set(image, self->pager->pages_[self->index].icon.c_str(), nullptr);
        evas_object_size_hint_aspect_set(image, EVAS_ASPECT_CONTROL_VERTICAL, 1, 1);
        return image;
    }

    static void rowChosen(void* row, Evas_Object*, void*) {
        const auto* self = static_cast<Row*>(row);
        self->pager->open(self->index);
    }

    void open(size_t index) {
        scroller_ = elm_scroller_add(naviframe_);
        elm_scroller_bounce_set(scroller_, EINA_FALSE, EINA_FALSE);
        elm_scroller_policy_set(scroller_, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
        elm_scroller_page_relative_set(scroller_, 1.0, 0.0);
        elm_scroller_page_scroll_limit_set(scroller_, 1, 0);
        Evas_Object* row = elm_box_add(scroller_);
        elm_box_horizontal_set(row, EINA_TRUE);
        evas_object_size_hint_weight_set(row, 0, EVAS_HINT_EXPAND);
        evas_object_size_hint_align_set(row, EVAS_HINT_FILL, EVAS_HINT_FILL);
        for (size_t i = 0; i < pages_.size(); ++i) {
            Evas_Object* place = elm_box_add(row);
            Evas_Object* page = bench::makeSized(row, place, width, 1);
            evas_object_size_hint_weight_set(page, 0, EVAS_HINT_EXPAND);
            evas_object_size_hint_align_set(page, EVAS_HINT_FILL, EVAS_HINT_FILL);
            elm_box_pack_end(row, page);
            places_.push_back(place);
        }
        elm_object_content_set(scroller_, row);
        fillPage(index);
        elm_naviframe_item_push(naviframe_, "Page", nullptr, nullptr, scroller_, nullptr);
        evas_smart_objects_calculate(evas_object_evas_get(scroller_));
        elm_scroller_page_show(scroller_, static_cast<int>(index), 0);
        ecore_timer_add(secondsToOtherPages, fillOthers, this);
    }

    static Eina_Bool fillOthers(void* pager) {
        ecore_idler_add([](void* self) -> Eina_Bool { return static_cast<BarePager*>(self)->fillNext(); }, pager);
        return ECORE_CALLBACK_CANCEL;
    }

    bool fillNext() {
        fillPage(next_);
        return ++next_ < pages_.size();
    }

    void fillPage(size_t index) {
        if (!places_[index]) {
            return;
        }
        elm_box_pack_end(places_[index], bench::makeBarePage(places_[index], pages_[index]));
        places_[index] = nullptr;
    }

    std::vector<bench::Page> pages_;
    std::vector<Row> rows_;
    Evas_Object* naviframe_ = nullptr;
    Evas_Object* scroller_ = nullptr;
    /// Where each page goes; null when it is there.
    std::vector<Evas_Object*> places_;
    size_t next_ = 0;
};

int run(int argc, char** argv) {
    ecore_app_no_system_modules();
    efreet_cache_disable();
    setenv("ELM_PROFILE", "mobile", 1);
    elm_init(argc, argv);
    elm_policy_set(ELM_POLICY_QUIT, ELM_POLICY_QUIT_LAST_WINDOW_CLOSED);
    BarePager pager(bench::readPages(argv[1]));
    // Pictures inside the texts are named relative to it.
    if (chdir("/") != 0 || !pager.show()) {
        return 1;
    }
    elm_run();
    elm_shutdown();
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return argc == 2 ? run(argc, argv) : 2;
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "bare-pager: %s\n", failure.what());
        return 1;
    }
}
