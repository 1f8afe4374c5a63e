#pragma once

/// The folder of the application's package. A build that stages the package elsewhere says where.
#ifndef KEST_APP_ROOT
#define KEST_APP_ROOT "/opt/usr/apps/com.ravella.kest"
#endif

/// The fixed paths of the device that the application uses as they stand.
namespace kest_paths {

/// Stands in for the shared resource directory of an application that the application manager does not know.
constexpr char sharedResources[] = KEST_APP_ROOT "/shared/res/";
/// The application's own gettext catalogues.
constexpr char locale[] = KEST_APP_ROOT "/res/locale";
/// The system's gettext catalogues.
constexpr char systemLocale[] = "/usr/share/locale";
/// The application's icon among those that the quick panel keeps for notifications.
constexpr char notificationIcon[] = "/usr/apps/com.ravella.quickpanel/shared/res/noti_icons/Kest/noti_kest.png";

}  // namespace kest_paths

/// The application's id on the device.
constexpr char KEST_APP_ID[] = "com.ravella.kest";
