#include "package_manager.h"

#include "Service.h"

#include <memory>

struct package_manager_s {
    device::Events::Subscription subscription;
};

namespace {

package_manager_event_type_e typeOf(const device::PackageEvent& event) {
    switch (event.type) {
    case device::PackageEvent::Type::Install:
        return PACKAGE_MANAGER_EVENT_TYPE_INSTALL;
    case device::PackageEvent::Type::Uninstall:
        return PACKAGE_MANAGER_EVENT_TYPE_UNINSTALL;
    case device::PackageEvent::Type::Update:
        break;
    }
    return PACKAGE_MANAGER_EVENT_TYPE_UPDATE;
}

package_manager_event_state_e stateOf(const device::PackageEvent& event) {
    switch (event.state) {
    case device::PackageEvent::State::Started:
        return PACKAGE_MANAGER_EVENT_STATE_STARTED;
    case device::PackageEvent::State::Processing:
        return PACKAGE_MANAGER_EVENT_STATE_PROCESSING;
    case device::PackageEvent::State::Completed:
        return PACKAGE_MANAGER_EVENT_STATE_COMPLETED;
    case device::PackageEvent::State::Failed:
        break;
    }
    return PACKAGE_MANAGER_EVENT_STATE_FAILED;
}

}  // namespace

int package_manager_create(package_manager_h* manager) {
    return service::call("package_manager_create", [&]() -> int {
        if (!manager)
            return PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
        *manager = std::make_unique<package_manager_s>().release();
        return PACKAGE_MANAGER_ERROR_NONE;
    });
}

int package_manager_destroy(package_manager_h manager) {
    return service::call("package_manager_destroy", [&]() -> int {
        const std::unique_ptr<package_manager_s> owned(manager);
        return owned ? PACKAGE_MANAGER_ERROR_NONE : PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
    });
}

int package_manager_set_event_cb(package_manager_h manager, package_manager_event_cb callback, void* user_data) {
    return service::callOnDevice("package_manager_set_event_cb", [&](device::Device& device) -> int {
        if (!manager || !callback)
            return PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
        manager->subscription = device.events().onPackage([callback, user_data](const device::PackageEvent& event) {
            callback("tpk", event.id.c_str(), typeOf(event), stateOf(event), event.progress,
                     static_cast<package_manager_error_e>(event.error), user_data);
        });
        return PACKAGE_MANAGER_ERROR_NONE;
    });
}

int package_manager_unset_event_cb(package_manager_h manager) {
    return service::call("package_manager_unset_event_cb", [&]() -> int {
        if (!manager)
            return PACKAGE_MANAGER_ERROR_INVALID_PARAMETER;
        manager->subscription.reset();
        return PACKAGE_MANAGER_ERROR_NONE;
    });
}
