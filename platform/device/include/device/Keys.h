#pragma once

/// The vconf keys that the platform itself reads, and their values on a fresh device.
namespace device::keys {

/// Display language with its codeset, for example "ko_KR.UTF-8".
inline constexpr char language[] = "db/menu_widget/language";
/// Country code of the device's customisation, for example "IN". Absent on a fresh device.
inline constexpr char country[] = "db/csc/text_string_country";
/// "light" or "dark".
inline constexpr char theme[] = "db/setting/theme";
/// Screen profile, "720x1280" or "480x800".
inline constexpr char screen[] = "db/display/profile";

inline constexpr char defaultLanguage[] = "en_US.UTF-8";
inline constexpr char defaultTheme[] = "light";
inline constexpr char defaultScreen[] = "720x1280";

}  // namespace device::keys
