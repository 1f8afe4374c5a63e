#include "PagerTest.h"

#include <Ecore_Evas.h>
#include <device/Keys.h>

#include <array>
#include <cstdio>
#include <filesystem>

namespace {

std::string numbered(int number, const std::string& end) {
    std::array<char, 16> digits{};
    std::snprintf(digits.data(), digits.size(), "%02d", number);
    return std::string("a_") + digits.data() + end;
}

std::vector<Evas_Object*> childrenOf(const Evas_Object* box) {
    std::vector<Evas_Object*> children;
    Eina_List* list = elm_box_children_get(box);
    void* each = nullptr;
    EINA_LIST_FREE(list, each)
    children.push_back(static_cast<Evas_Object*>(each));
    return children;
}

}  // namespace

std::string PagerTest::drawPicture(const std::string& name, int width, int height, unsigned int colour) const {
    const std::filesystem::path path = picturePath(name);
    std::filesystem::create_directories(path.parent_path());
    Ecore_Evas* frame = ecore_evas_buffer_new(1, 1);
    Evas_Object* picture = evas_object_image_add(ecore_evas_get(frame));
    const std::vector<unsigned int> pixels(static_cast<std::size_t>(width) * static_cast<std::size_t>(height),
                                           0xff000000 | colour);
    evas_object_image_size_set(picture, width, height);
    evas_object_image_data_copy_set(picture, const_cast<unsigned int*>(pixels.data()));
    EXPECT_TRUE(evas_object_image_save(picture, path.c_str(), nullptr, "compress=1"));
    ecore_evas_free(frame);
    return path;
}

void PagerTest::drawSequence(int count, const std::set<int>& marked) const {
    // Drawing them one by one would take most of a test's time.
    const std::string first = drawPicture(numbered(1, ".png"));
    for (int picture = 0; picture < count; ++picture) {
        if (picture > 0)
            std::filesystem::copy_file(first, picturePath(numbered(picture + 1, ".png")));
        if (marked.count(picture))
            std::filesystem::copy_file(first, picturePath(numbered(picture + 1, "_touch.png")));
    }
}

std::string PagerTest::tip(const std::string& picture, const std::string& text, const std::string& more) {
    return "<title>Title</title><appname>Name</appname><image>contents/images/" + picture + "</image>" +
           kest_files::contents(text) + more;
}

void PagerTest::writeTips(const std::vector<std::string>& tips) const {
    std::vector<kest_files::Menu> menus;
    for (const std::string& item : tips) {
        const std::string path = "contents/tip" + std::to_string(menus.size()) + ".xml";
        writeDetail(item, path);
        menus.push_back({path});
    }
    writeMenus(menus);
}

void PagerTest::useSmallScreen() const {
    device()->settings().set(device::keys::screen, "480x800");
    const std::filesystem::path resources = device().appRoot() / "res";
    std::filesystem::create_directory(resources / "LDPI");
    std::filesystem::create_directory_symlink("../table", resources / "LDPI/table");
}

void PagerTest::startEmpty() {
    app_.takesRequests = false;
    running_.emplace(app_);
    if (!isDrawn_)
        undrawn_.emplace(running().window());
    settle();
    newLog();
}

void PagerTest::push(int menu, bool onTop, const std::function<void(Pager&)>& meanwhile) {
    if (!running_)
        startEmpty();
    calls::forget();
    test_ui::inMainLoop([&] {
        pager_ = new Pager(menu + 2, onTop);
        naviframe().push(pager_, nullptr, nullptr);
        meanwhile(pager());
    });
}

void PagerTest::open(int menu) {
    push(menu);
    ASSERT_TRUE(test_ui::runUntil([&] { return info(menu) != nullptr; }));
}

Evas_Object* PagerTest::page(int index) {
    return childrenOf(elm_object_content_get(pager().getScroller())).at(static_cast<std::size_t>(index));
}

std::vector<Evas_Object*> PagerTest::pictures(int index) {
    return childrenOf(elm_object_content_get(pictureScroller(index)));
}

int PagerTest::pictureInView(int index) {
    int picture = 0;
    elm_scroller_current_page_get(pictureScroller(index), &picture, nullptr);
    return picture;
}

int PagerTest::scrolledTo(int index) {
    int y = 0;
    elm_scroller_region_get(pictureScroller(index), nullptr, &y, nullptr, nullptr);
    return y;
}

int PagerTest::pageInView() {
    int index = 0;
    elm_scroller_current_page_get(pager().getScroller(), &index, nullptr);
    return index;
}

void PagerTest::say(const char* signal, int index) {
    edje_object_signal_emit(elm_layout_edje_get(video(index)), signal, "elm");
    test_ui::runFor(0.01);
}

void PagerTest::swipe(int pages) {
    const test_ui::Point middle = test_ui::geometry(pager().getScroller()).middle();
    const int y = test_ui::geometry(video(pageInView())).middle().y;
    screen().swipe({middle.x + 260 * pages, y}, {middle.x - 260 * pages, y}, 0.2);
}

std::vector<kest_log::Line> PagerTest::newLogOf(const std::string& file) {
    std::vector<kest_log::Line> found;
    for (const kest_log::Line& line : newLog())
        if (line.file == file)
            found.push_back(line);
    return found;
}

std::string PagerTest::titleMarkup(const std::string& icon, const std::string& title) {
    return "<align=center><item size=62x62 vsize=full href=file:/" + icon +
           "></item>  <color=#000000><font_weight='Regular'><font_width='condensed'><font_size=46>" + title +
           "</font_size></font_width></font_weight></color></align>";
}

std::string PagerTest::textMarkup(const std::string& text) {
    return "<font_style='Regular' font_size=36 align=left linegap=10>" + text + "</>";
}

std::string PagerTest::fileOf(const Evas_Object* image) {
    const char* file = nullptr;
    elm_image_file_get(image, &file, nullptr);
    return file ? file : "";
}
