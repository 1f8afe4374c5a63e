#pragma once

/// The device's settings that the catalogue is read by.
namespace kest_vconf_keys {

/// The display language, as "en_US.UTF-8".
constexpr char displayLanguage[] = "db/menu_widget/language";
/// The country code that the device's customisation sets, as "IN".
constexpr char country[] = "db/csc/text_string_country";

}  // namespace kest_vconf_keys
