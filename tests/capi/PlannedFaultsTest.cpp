#include "app_common.h"
#include "app_control.h"
#include "app_manager.h"
#include "app_preference.h"
#include "app_resource_manager.h"
#include "bundle.h"
#include "dlog.h"
#include "notification.h"
#include "package_manager.h"
#include "ravella-log-client.h"
#include "support/TemporaryDevice.h"
#include "system_settings.h"
#include "vconf.h"

#include <gtest/gtest.h>

#include <regex>
#include <set>
#include <sstream>

namespace {

using support::TemporaryDevice;

constexpr int planned = -4711;

/// What a service that returns a pointer or nothing comes to: NULL is the planned failure.
int codeOf(const void* pointer) {
    return pointer ? 0 : planned;
}

/// Handles and places for results, as an application has them.
struct Arguments {
    char* text = nullptr;
    int number = 0;
    app_control_h request = nullptr;
    bundle* record = nullptr;
    package_info_h info = nullptr;
    package_info_h lookedUp = nullptr;
    package_manager_h packages = nullptr;
    ravella_log_manager_h usage = nullptr;
    notification_h notification = nullptr;
    std::string callbacks;

    Arguments() {
        app_control_create(&request);
        record = bundle_create();
        package_info_create("com.example.app", &info);
        package_manager_create(&packages);
        ravella_log_manager_create(&usage);
        notification = notification_create(NOTIFICATION_TYPE_NOTI);
        app_control_set_app_id(request, "com.example.app");
    }
    ~Arguments() {
        device::faults::clear();
        app_control_destroy(request);
        bundle_free(record);
        package_info_destroy(info);
        package_manager_destroy(packages);
        ravella_log_manager_destroy(usage);
        notification_free(notification);
    }
    Arguments(const Arguments&) = delete;
    Arguments& operator=(const Arguments&) = delete;
};

void packageEvent(const char*, const char*, package_manager_event_type_e, package_manager_event_state_e, int,
                  package_manager_error_e, void*) {}

bool eachExtra(app_control_h, const char*, void*) {
    return true;
}

/// Every service: its name and a call that gives the planned code when the plan strikes.
struct Service {
    const char* name;
    int (*call)(Arguments&);
};

const Service services[] = {
    {"app_get_resource_path", [](Arguments& a) { return codeOf(a.text = app_get_resource_path()); }},
    {"app_get_id", [](Arguments& a) { return app_get_id(&a.text); }},
    {"app_control_create", [](Arguments& a) { return app_control_create(&a.request); }},
    {"app_control_destroy", [](Arguments& a) { return app_control_destroy(a.request); }},
    {"app_control_set_app_id", [](Arguments& a) { return app_control_set_app_id(a.request, "id"); }},
    {"app_control_get_app_id", [](Arguments& a) { return app_control_get_app_id(a.request, &a.text); }},
    {"app_control_add_extra_data", [](Arguments& a) { return app_control_add_extra_data(a.request, "k", "v"); }},
    {"app_control_get_extra_data", [](Arguments& a) { return app_control_get_extra_data(a.request, "k", &a.text); }},
    {"app_control_foreach_extra_data",
     [](Arguments& a) { return app_control_foreach_extra_data(a.request, eachExtra, nullptr); }},
    {"app_control_send_launch_request",
     [](Arguments& a) { return app_control_send_launch_request(a.request, nullptr, nullptr); }},
    {"app_manager_get_shared_resource_path",
     [](Arguments& a) { return app_manager_get_shared_resource_path("com.example.app", &a.text); }},
    {"preference_set_string", [](Arguments&) { return preference_set_string("key", "value"); }},
    {"preference_get_string", [](Arguments& a) { return preference_get_string("key", &a.text); }},
    {"preference_remove_all", [](Arguments&) { return preference_remove_all(); }},
    {"app_resource_manager_get",
     [](Arguments& a) { return app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "a.png", &a.text); }},
    {"bundle_create", [](Arguments&) { return codeOf(bundle_create()); }},
    {"bundle_free", [](Arguments& a) { return bundle_free(a.record); }},
    {"bundle_add_str", [](Arguments& a) { return bundle_add_str(a.record, "key", "value"); }},
    {"bundle_get_str", [](Arguments& a) { return bundle_get_str(a.record, "key", &a.text); }},
    {"bundle_foreach_str",
     [](Arguments& a) {
         device::faults::clear();
         bundle_add_str(a.record, "key", "value");
         device::faults::plan("bundle_foreach_str", planned);
         bundle_foreach_str(
             a.record, [](const char* key, const char*, void* all) { *static_cast<std::string*>(all) += key; },
             &a.callbacks);
         return a.callbacks.empty() ? planned : 0;
     }},
    {"dlog_print", [](Arguments&) { return dlog_print(DLOG_INFO, "TAG", "text") == -1 ? planned : 0; }},
    {"notification_create", [](Arguments&) { return codeOf(notification_create(NOTIFICATION_TYPE_NOTI)); }},
    {"notification_free", [](Arguments& a) { return notification_free(a.notification); }},
    {"notification_set_layout",
     [](Arguments& a) { return notification_set_layout(a.notification, NOTIFICATION_LY_NOTI_EVENT_SINGLE); }},
    {"notification_set_text",
     [](Arguments& a) {
         return notification_set_text(a.notification, NOTIFICATION_TEXT_TYPE_TITLE, "text", "key",
                                      NOTIFICATION_VARIABLE_TYPE_NONE);
     }},
    {"notification_set_image",
     [](Arguments& a) { return notification_set_image(a.notification, NOTIFICATION_IMAGE_TYPE_ICON, "/icon.png"); }},
    {"notification_set_launch_option",
     [](Arguments& a) {
         return notification_set_launch_option(a.notification, NOTIFICATION_LAUNCH_OPTION_APP_CONTROL, a.request);
     }},
    {"notification_set_display_applist",
     [](Arguments& a) { return notification_set_display_applist(a.notification, NOTIFICATION_DISPLAY_APP_ALL); }},
    {"notification_post", [](Arguments& a) { return notification_post(a.notification); }},
    {"package_info_create", [](Arguments& a) { return package_info_create("com.example.app", &a.lookedUp); }},
    {"package_manager_get_package_info",
     [](Arguments& a) { return package_manager_get_package_info("com.example.app", &a.lookedUp); }},
    {"package_info_destroy", [](Arguments& a) { return package_info_destroy(a.info); }},
    {"package_info_get_version", [](Arguments& a) { return package_info_get_version(a.info, &a.text); }},
    {"package_info_get_icon", [](Arguments& a) { return package_info_get_icon(a.info, &a.text); }},
    {"package_info_get_label", [](Arguments& a) { return package_info_get_label(a.info, &a.text); }},
    {"package_manager_create", [](Arguments& a) { return package_manager_create(&a.packages); }},
    {"package_manager_destroy", [](Arguments& a) { return package_manager_destroy(a.packages); }},
    {"package_manager_set_event_cb",
     [](Arguments& a) { return package_manager_set_event_cb(a.packages, packageEvent, nullptr); }},
    {"package_manager_unset_event_cb", [](Arguments& a) { return package_manager_unset_event_cb(a.packages); }},
    {"system_settings_get_value_string",
     [](Arguments& a) { return system_settings_get_value_string(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE, &a.text); }},
    {"vconf_get_str", [](Arguments& a) { return codeOf(a.text = vconf_get_str("db/setting/theme")); }},
    {"vconf_set_str", [](Arguments&) { return vconf_set_str("key", "value") == -1 ? planned : 0; }},
    {"ravella_log_manager_create", [](Arguments& a) { return ravella_log_manager_create(&a.usage); }},
    {"ravella_log_manager_insert",
     [](Arguments& a) {
         return ravella_log_manager_insert(a.usage, "content://x", a.record, nullptr, nullptr, &a.number);
     }},
    {"ravella_log_manager_destroy", [](Arguments& a) { return ravella_log_manager_destroy(a.usage); }},
};

class PlannedFault : public testing::TestWithParam<Service> {};

TEST_P(PlannedFault, StrikesTheServiceOfItsName) {
    const TemporaryDevice device;
    Arguments arguments;
    device::faults::plan(GetParam().name, planned);
    EXPECT_EQ(GetParam().call(arguments), planned);
    EXPECT_EQ(arguments.text, nullptr);
    EXPECT_FALSE(device::faults::take(GetParam().name)) << "the plan was not used up";
}

/// The functions that a public header declares.
std::set<std::string> declaredIn(const std::filesystem::path& header) {
    static const std::regex declaration("^(?:int|void|char\\*|void\\*|bundle\\*|notification_h) ([a-z_]+)\\(");
    std::set<std::string> names;
    std::istringstream lines(support::readFile(header));
    std::smatch match;
    for (std::string line; std::getline(lines, line);)
        if (std::regex_search(line, match, declaration))
            names.insert(match[1]);
    return names;
}

TEST(PlannedFaults, AreTriedForEveryServiceThatIsDeclared) {
    std::set<std::string> declared;
    for (const char* folder : {CAPI_INCLUDE_DIR, LOG_CLIENT_INCLUDE_DIR})
        for (const auto& header : std::filesystem::directory_iterator(folder))
            declared.merge(declaredIn(header.path()));
    // Defined by the framework, whose tests try it.
    declared.erase("app_get_preinitialized_window");
    std::set<std::string> tried;
    for (const Service& service : services)
        tried.insert(service.name);
    EXPECT_EQ(declared, tried);
}

INSTANTIATE_TEST_SUITE_P(, PlannedFault, testing::ValuesIn(services),
                         [](const auto& service) { return std::string(service.param.name); });

}  // namespace
