#pragma once

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Reads a device setting.
 * @param key for example "db/menu_widget/language"
 * @return the value, to be freed with free(); NULL when the key was never set or cannot be read
 */
char* vconf_get_str(const char* key);

/**
 * Writes a device setting and tells every process of the device.
 * @return 0, or -1 when it could not be written or an argument is NULL
 */
int vconf_set_str(const char* key, const char* value);

#ifdef __cplusplus
}
#endif
