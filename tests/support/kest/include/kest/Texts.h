#pragma once

#include <filesystem>
#include <string>
#include <utility>
#include <vector>

/// The display language and the gettext catalogues, as an application's start leaves them. The application finds its
/// own domain in its fixed folder; what it binds to the system's folder is found in a folder of the tests'.
namespace kest_texts {

/// What stands in for "/usr/share/locale": has the domains "tips", "sys_string" and "contacts".
std::filesystem::path systemLocale();

/// Binds the domains as an application's start does and takes the language of the device ("ko_KR.UTF-8").
void start(const std::string& language);
/// Has gettext translate into that language from now on.
void useLanguage(const std::string& language);

/// What was bound since start(), in its order: domain and folder, as the application named them.
const std::vector<std::pair<std::string, std::string>>& bindings();

}  // namespace kest_texts
