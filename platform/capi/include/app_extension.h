#pragma once

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Hands out the window that the launcher has made ahead of the application's start. Can be had once.
 * @param win_name becomes the window's name
 * @return the window (an Evas_Object *), owned by the caller from then on; NULL when there is none (any more)
 */
void* app_get_preinitialized_window(const char* win_name);

#ifdef __cplusplus
}
#endif
