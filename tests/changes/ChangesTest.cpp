#include "ChangesTest.h"

#include "Calls.h"

#include <device/Error.h>
#include <device/Usage.h>

#include <app_control.h>

#include <algorithm>

#include <sys/stat.h>

namespace fs = std::filesystem;

namespace {

constexpr int screenWidth = 720;
constexpr int headerHeight = 112;

void drawPicture(const fs::path& file) {
    const std::vector<unsigned int> pixels(72 * 66, 0xff336699);
    EXPECT_TRUE(test_ui::Picture(72, 66, pixels.data()).save(file));
}

std::string groupOf(const Evas_Object* layout) {
    const char* file = nullptr;
    const char* group = nullptr;
    elm_layout_file_get(const_cast<Evas_Object*>(layout), &file, &group);
    return group ? group : "";
}

/// The first line, without the icon and the blanks around it.
std::string firstLine(std::string text) {
    text.resize(std::min(text.size(), text.find('\n')));
    const std::string icon = "\uFFFC";
    if (const auto at = text.find(icon); at != std::string::npos)
        text.erase(at, icon.size());
    text.erase(0, text.find_first_not_of(' '));
    return text;
}

}  // namespace

ChangesTest::ChangesTest() {
    for (const tips::Tip& tip : tips::all()) {
        if (tip.appid == "com.example.weather")
            continue;
        if (tip.appid != kest && !device()->packages().find(tip.appid))
            addApplication(tip.appid);
        writeTip(tip, resources(tip.appid));
    }
    addApplication("com.example.other");
    for (const char* picture : {"a_01.png", "a_01_touch.png", "a_02.png", "a_02_touch.png", "a_03.png"})
        drawPicture(resources("com.example.alarm") / "contents" / picture);
    writeMenuFile(tips::atFirst());
}

void ChangesTest::writeTip(const tips::Tip& tip, const fs::path& sharedResources) {
    support::writeFile(sharedResources / tip.path(), tip.detail());
    support::writeFile(sharedResources / tip.stringsPath(), tip.strings());
}

void ChangesTest::writeMenuFile(const Names& names) const {
    std::vector<kest_files::Menu> menus;
    for (const std::string& name : tips::with(tips::with(names, "Weather"), "Cricket")) {
        const tips::Tip& tip = tips::named(name);
        menus.push_back({tip.path(), tip.appid, tip.regions});
    }
    writeMenus(menus);
}

void ChangesTest::begin(const std::vector<std::string>& words) {
    beginAtOnce(words);
    test_ui::runFor(1);
}

void ChangesTest::beginAtOnce(const std::vector<std::string>& words) {
    running_.emplace(app_, words);
    undrawn_.emplace(running().window());
}

void ChangesTest::request(const Extras& extras) {
    app_control_h handle = nullptr;
    app_control_create(&handle);
    for (const auto& [key, value] : extras)
        app_control_add_extra_data(handle, key.c_str(), value.c_str());
    test_ui::inMainLoop([&] { app_.onAppControl(handle, false); });
    app_control_destroy(handle);
}

fs::path ChangesTest::packageOf(const std::string& appid, const std::string& version) {
    const fs::path folder = device().folder() / ("package" + std::to_string(++packages_));
    return support::TemporaryDevice::makePackage(folder, appid, version);
}

void ChangesTest::install(const std::string& appid) {
    const fs::path package = packageOf(appid, "1.0.0");
    for (const tips::Tip& tip : tips::all())
        if (tip.appid == appid)
            writeTip(tip, package / "shared/res");
    device()->packages().install(package);
}

void ChangesTest::update(const std::string& appid) {
    device()->packages().install(packageOf(appid, "2.0.0"));
}

void ChangesTest::failToInstall(const std::string& appid) {
    const fs::path package = packageOf(appid, "1.0.0");
    ASSERT_EQ(mkfifo((package / "res/pipe").c_str(), 0600), 0);
    EXPECT_THROW(device()->packages().install(package), device::Error);
}

std::string ChangesTest::top() {
    const app_assist::WView* view = naviframe().getTopView();
    if (!view)
        return "nothing";
    const std::string header = test_ui::itemText(view->getNaviItem(), "elm.text.title");
    if (topView() == "KestContentView")
        return "page " + header + ": " + firstLine(test_ui::plainText(onPage("Elm_Label"))) + ", " +
               firstLine(test_ui::plainText(onPage("Elm_Entry")));
    for (Elm_Object_Item* row : test_ui::rows(list()))
        if (test_ui::rowGeometry(row).y >= headerHeight)
            return "list " + header + ": " + test_ui::itemText(row, "elm.text.main") +
                   test_ui::itemText(row, "elm.text.main.left.bottom");
    return "list " + header + ": no rows";
}

unsigned int ChangesTest::levels() {
    Eina_List* items = elm_naviframe_items_get(naviframe().getEvasObj());
    const unsigned int count = eina_list_count(items);
    eina_list_free(items);
    return count;
}

std::vector<std::string> ChangesTest::rows() {
    std::vector<std::string> texts;
    for (Elm_Object_Item* row : test_ui::rows(list())) {
        // A list knows the texts of those that it shows.
        elm_genlist_item_show(row, ELM_GENLIST_ITEM_SCROLLTO_IN);
        test_ui::runFor(0.05);
        texts.push_back(test_ui::itemText(row, "elm.text.main.left.bottom") + ", " +
                        test_ui::itemText(row, "elm.text.sub.left.top"));
    }
    if (!texts.empty())
        texts.erase(texts.begin());
    return texts;
}

std::vector<std::string> ChangesTest::rowsOf(const Names& names, Language language) {
    std::vector<std::string> texts;
    for (const std::string& name : names)
        texts.push_back(tips::title(name, language) + ", " + tips::application(name, language));
    return texts;
}

std::string ChangesTest::pageOf(const std::string& name, const Names& names, Language language) {
    const auto place = std::find(names.begin(), names.end(), name) - names.begin() + 1;
    const std::string number = std::to_string(place), count = std::to_string(names.size());
    const std::string header =
        language == Language::Korean ? count + "개 중 " + number : "Tips " + number + "/" + count;
    return "page " + header + ": " + tips::title(name, language) + ", " + tips::text(name, language);
}

Evas_Object* ChangesTest::onPage(const std::string& type) {
    for (Evas_Object* widget : test_ui::widgets(naviframe().getTopView()->getEvasObj(), type)) {
        const int x = test_ui::geometry(widget).middle().x;
        if (x >= 0 && x < screenWidth)
            return widget;
    }
    return nullptr;
}

Evas_Object* ChangesTest::pictureArea() {
    for (Evas_Object* layout : test_ui::widgets(naviframe().getTopView()->getEvasObj(), "Elm_Layout"))
        if (test_ui::geometry(layout).x >= 0 && test_ui::geometry(layout).x < screenWidth &&
            groupOf(layout) == "layout/multi_image")
            return layout;
    return nullptr;
}

unsigned int ChangesTest::ground(int y) {
    return screen().picture().pixel(screenWidth - 1, y);
}

int ChangesTest::pictureInView() {
    const Evas_Object* area = pictureArea();
    if (!area)
        return -1;
    int picture = -1;
    elm_scroller_current_page_get(elm_object_part_content_get(area, "scroller"), &picture, nullptr);
    return picture;
}

void ChangesTest::tapRow(std::size_t menu) {
    Elm_Object_Item* row = test_ui::rows(list()).at(menu + 1);
    elm_genlist_item_show(row, ELM_GENLIST_ITEM_SCROLLTO_IN);
    test_ui::runFor(0.1);
    screen().tap(test_ui::rowGeometry(row).middle());
}

void ChangesTest::swipeToTheNextPage() {
    screen().swipe({600, 400}, {100, 400}, 0.2);
}

void ChangesTest::back() {
    screen().key("XF86Back");
}

void ChangesTest::tapLink() {
    screen().tap(test_ui::link(onPage("Elm_Entry"), "app").middle());
}

void ChangesTest::reply() {
    Evas_Object* theme = elm_layout_edje_get(pictureArea());
    for (const char* signal : {"reply,pressed", "reply,uppressed"}) {
        edje_object_signal_emit(theme, signal, "elm");
        test_ui::runFor(0.05);
    }
}

std::vector<std::string> ChangesTest::newRecords() {
    std::vector<std::string> records;
    const auto all = device()->usage().all();
    for (; recordsRead_ < all.size(); ++recordsRead_) {
        EXPECT_EQ(all[recordsRead_].uri, "content://com.ravella.logprovider/log/use_app_feature_survey");
        std::string extra, feature, app;
        for (const auto& [key, value] : all[recordsRead_].values)
            (key == "feature" ? feature : key == "app_id" ? app : extra) = key == "extra" ? " " + value : value;
        EXPECT_EQ(app, kest);
        records.push_back(feature + extra);
    }
    return records;
}

std::vector<std::string> ChangesTest::newErrors() {
    std::vector<std::string> errors;
    for (const calls::Line& line : calls::newLines())
        if (line.level == 'E')
            errors.push_back(line.message);
    return errors;
}
