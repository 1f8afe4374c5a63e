#include "system_settings.h"

#include "Service.h"
#include "device/Keys.h"

int system_settings_get_value_string(system_settings_key_e key, char** value) {
    return service::callOnDevice("system_settings_get_value_string", [&](device::Device& device) -> int {
        if (!value)
            return SYSTEM_SETTINGS_ERROR_INVALID_PARAMETER;
        switch (key) {
        case SYSTEM_SETTINGS_KEY_LOCALE_COUNTRY:
            *value = service::copyOf(device.settings().get(device::keys::country).value_or(""));
            return SYSTEM_SETTINGS_ERROR_NONE;
        case SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE:
            *value = service::copyOf(device.language());
            return SYSTEM_SETTINGS_ERROR_NONE;
        }
        return SYSTEM_SETTINGS_ERROR_NOT_SUPPORTED;
    });
}
