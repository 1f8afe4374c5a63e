// The least that an EFL program with a list does: a window of the device's size, in it a list with rows of the default
// style, a picture and a text each. Arguments: the pictures, in turn. What start-up is compared with.

#include <Efreet.h>
#include <Elementary.h>

#include <cstring>

namespace {

constexpr int width = 720;
constexpr int height = 1280;
constexpr int rows = 12;

/// The pictures' paths.
const char* const* pictures;
int pictureCount;

char* rowText(void*, Evas_Object*, const char* part) {
    return std::strcmp(part, "elm.text") == 0 ? strdup("What a row has to say") : nullptr;
}

Evas_Object* rowContent(void* data, Evas_Object* list, const char* part) {
    if (std::strcmp(part, "elm.swallow.icon") != 0) {
        return nullptr;
    }
    const char* picture = pictures[*static_cast<int*>(data) % pictureCount];
    Evas_Object* image = elm_image_add(list);
    elm_image_file_set(image, picture, nullptr);
    evas_object_size_hint_aspect_set(image, EVAS_ASPECT_CONTROL_VERTICAL, 1, 1);
    return image;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        return 1;
    }
    pictures = argv + 1;
    pictureCount = argc - 1;
    ecore_app_no_system_modules();
    efreet_cache_disable();
    elm_init(argc, argv);
    elm_policy_set(ELM_POLICY_QUIT, ELM_POLICY_QUIT_LAST_WINDOW_CLOSED);

    Evas_Object* window = elm_win_util_standard_add("bare-window", "Bare window");
    if (!window) {
        return 1;
    }
    Evas_Object* list = elm_genlist_add(window);
    evas_object_size_hint_weight_set(list, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_win_resize_object_add(window, list);

    static Elm_Genlist_Item_Class row;
    row.version = ELM_GENLIST_ITEM_CLASS_VERSION;
    row.item_style = "default";
    row.func.text_get = rowText;
    row.func.content_get = rowContent;
    static int indices[rows];
    for (int i = 0; i < rows; ++i) {
        indices[i] = i;
        elm_genlist_item_append(list, &row, &indices[i], nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
    }
    evas_object_show(list);
    evas_object_resize(window, width, height);
    evas_object_show(window);
    elm_run();
    elm_shutdown();
    return 0;
}
