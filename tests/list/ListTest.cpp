#include "ListTest.h"

#include <Ecore_Evas.h>

void ListTest::writeTips(const std::vector<std::string>& titles) const {
    std::vector<kest_files::Menu> menus;
    for (const std::string& title : titles) {
        const std::string path = "contents/tip" + std::to_string(menus.size()) + ".xml";
        writeDetail("<title>" + title + "</title><appname>Name of " + title + "</appname>", path);
        menus.push_back({path});
    }
    writeMenus(menus);
}

Elm_Object_Item* ListTest::menuRow(std::size_t menu) {
    return test_ui::rows(list()).at(menu + 1);
}

std::vector<ListTest::Texts> ListTest::menuTexts() {
    std::vector<Texts> all;
    const auto rows = test_ui::rows(list());
    for (std::size_t i = 1; i < rows.size(); ++i)
        all.push_back(texts(rows[i]));
    return all;
}

ListTest::Texts ListTest::texts(const Elm_Object_Item* row) {
    return {text(row, "elm.text.sub.left.top"), text(row, "elm.text.main.left.bottom")};
}

std::string ListTest::drawIcon(unsigned int colour) const {
    constexpr int size = 64;
    Ecore_Evas* frame = ecore_evas_buffer_new(1, 1);
    Evas_Object* picture = evas_object_image_add(ecore_evas_get(frame));
    std::vector<unsigned int> pixels(size * size, 0xff000000 | colour);
    evas_object_image_size_set(picture, size, size);
    evas_object_image_data_copy_set(picture, pixels.data());
    const std::string icon = device()->packages().find(kest)->icon;
    std::filesystem::create_directories(std::filesystem::path(icon).parent_path());
    EXPECT_TRUE(evas_object_image_save(picture, icon.c_str(), nullptr, nullptr));
    ecore_evas_free(frame);
    return icon;
}

void ListTest::pushOtherView() {
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    ASSERT_EQ(topView(), "OtherView");
}

void ListTest::tap(Elm_Object_Item* row) {
    screen().tap(test_ui::rowGeometry(row).middle());
}

void ListTest::openPager(std::size_t menu) {
    tap(menuRow(menu));
    settle();
    ASSERT_EQ(topView(), "KestContentView");
}

std::vector<std::string> ListTest::usageExtras() const {
    std::vector<std::string> extras;
    for (const device::UsageRecord& record : device()->usage().all())
        for (const auto& [key, value] : record.values)
            if (key == "extra")
                extras.push_back(value);
    return extras;
}
