#pragma once

#include <string>
#include <vector>

/// The tips of these tests, in two languages. A tip is called by its English title.
namespace tips {

enum class Language { English, Korean };

struct Tip {
    std::string name;
    std::string korean;
    std::string appid = "com.ravella.kest";
    std::string regions = "Global, India";
    std::string picture = "none.png";

    /// Its detail file, relative to the shared resources of its application.
    std::string path() const { return "contents/" + name + ".xml"; }
    std::string stringsPath() const { return "contents/" + name + "-string.xml"; }
    std::string detail() const;
    std::string strings() const;
};

/// All that there are, in the order of the main menu file.
const std::vector<Tip>& all();
const Tip& named(const std::string& name);

/// What a device lists that is fresh: without the weather, in no country, by the first menu file.
std::vector<std::string> atFirst();
/// The same with these left out, and these at their places.
std::vector<std::string> without(std::vector<std::string> names, const std::string& name);
std::vector<std::string> with(const std::vector<std::string>& names, const std::string& name);

/// What is read of a tip.
std::string title(const std::string& name, Language language);
std::string application(const std::string& name, Language language);
std::string text(const std::string& name, Language language);

/// The languages as the device calls them.
std::string setting(Language language);

}  // namespace tips
