#include "Rules.h"

#include <functional>
#include <map>
#include <optional>
#include <regex>
#include <set>

namespace architecture {
namespace {

const std::regex includeLine(R"(^\s*#\s*include\s*[<"]([^>"]+)[>"].*)");

bool startsWith(const std::string& text, const std::string& prefix) {
    return text.compare(0, prefix.size(), prefix) == 0;
}

bool isSource(const SourceFile& file) {
    static const std::regex source(R"(.*\.(cpp|h))");
    return std::regex_match(file.path, source);
}

/** Its sources, and what builds them. */
bool isOfTheApplication(const SourceFile& file) {
    return startsWith(file.path, "src/") || startsWith(file.path, "inc/");
}

bool isApplication(const SourceFile& file) {
    return isOfTheApplication(file) && isSource(file);
}

std::string at(const SourceFile& file, size_t line, const std::string& what) {
    return file.path + ":" + std::to_string(line + 1) + ": " + what;
}

/** The header that a line includes. */
std::optional<std::string> included(const std::string& line) {
    std::smatch match;
    if (!std::regex_match(line, match, includeLine)) {
        return std::nullopt;
    }
    return match[1].str();
}

/** What `check` says of each line of each file that `concerns` picks. */
Violations everyLine(const SourceTree& tree, const std::function<bool(const SourceFile&)>& concerns,
                     const std::function<std::optional<std::string>(const SourceFile&, size_t line)>& check) {
    Violations violations;
    for (const SourceFile& file : tree) {
        for (size_t line = 0; concerns(file) && line < file.lines.size(); ++line) {
            if (const auto what = check(file, line)) {
                violations.push_back(at(file, line, *what));
            }
        }
    }
    return violations;
}

/** The platform's public headers as they are included, each with its layer. */
std::map<std::string, std::string> publicHeaders(const SourceTree& tree) {
    static const std::regex header(R"(platform/([^/]+)/include/(.+\.h))");
    std::map<std::string, std::string> layers;
    for (const SourceFile& file : tree) {
        std::smatch match;
        if (std::regex_match(file.path, match, header)) {
            layers.emplace(match[2].str(), match[1].str());
        }
    }
    return layers;
}

/** EFL's headers with objects on a canvas; they and all that build on them are beyond the lower layers. */
bool isWidgetHeader(const std::string& header) {
    static const std::regex widgets(R"((Elementary|Evas|Edje|Ecore_Evas|Efl_Ui)(_\w+)?\.h|(elm|evas|edje)_\w+\.h)");
    return std::regex_match(header, widgets);
}

struct Layer {
    std::set<std::string> beneath;
    bool hasWidgets;
};

const std::map<std::string, Layer>& layers() {
    static const std::map<std::string, Layer> all = {
        {"device", {{}, false}},
        {"capi", {{"device"}, false}},
        {"log-client", {{"device", "capi"}, false}},
        {"efl-answers", {{"device"}, true}},
        {"notifier", {{"device", "efl-answers"}, false}},
        {"ui-extension", {{"device", "capi", "log-client"}, true}},
        {"remote-control", {{"device", "capi", "log-client"}, true}},
        {"app-assist", {{"device", "capi", "log-client", "efl-answers", "ui-extension", "remote-control"}, true}},
    };
    return all;
}

bool isStandardHeader(const std::string& header) {
    static const std::regex c("(assert|ctype|errno|fcntl|limits|locale|stdarg|stdbool|stddef|stdint|stdio|stdlib|"
                              "string|strings|time|unistd|sys/stat|sys/types)\\.h");
    // C++14's: what came later is not on the device.
    static const std::string cpp =
        " algorithm array atomic bitset cassert cctype cerrno cfenv cfloat chrono cinttypes climits "
        "clocale cmath codecvt complex condition_variable csetjmp csignal cstdarg cstddef cstdint "
        "cstdio cstdlib cstring ctime cuchar cwchar cwctype deque exception forward_list fstream "
        "functional future initializer_list iomanip ios iosfwd iostream istream iterator limits list "
        "locale map memory mutex new numeric ostream queue random ratio regex scoped_allocator set "
        "shared_mutex sstream stack stdexcept streambuf string system_error thread tuple type_traits "
        "typeindex typeinfo unordered_map unordered_set utility valarray vector ";
    return std::regex_match(header, c) || cpp.find(" " + header + " ") != std::string::npos;
}

/** What the device gives an application beside EFL. */
bool isDeviceHeader(const std::string& header) {
    static const std::regex framework(
        R"(app-assist/W(App|AppEventHandler|Naviframe|PageSlideView|UIObject|UiTimer|View|)"
        R"(Window)\.h)");
    static const std::regex services(
        R"((app_(common|control|extension|manager|preference|resource_manager)|bundle|dlog|notification|)"
        R"(package_(info|manager)|)"
        R"(ravella-log-client|system_settings|tizen_error|ui_extension|vconf)\.h)");
    return std::regex_match(header, framework) || std::regex_match(header, services);
}

}  // namespace

Violations applicationIncludesItsAllowedHeaders(const SourceTree& tree) {
    static const std::regex libraries(R"((Eina|Ecore|Evas|Edje|Elementary)\.h|libxml/\w+\.h|libintl\.h)");
    static const std::regex own(R"(Kest\w+\.h)");
    return everyLine(tree, isApplication, [](const auto& file, size_t line) -> std::optional<std::string> {
        const auto header = included(file.lines[line]);
        if (!header || isStandardHeader(*header) || std::regex_match(*header, libraries) ||
            std::regex_match(*header, own) || isDeviceHeader(*header)) {
            return std::nullopt;
        }
        return "includes " + *header + ", which an application on a device does not have";
    });
}

Violations applicationHasNoConditionalCode(const SourceTree& tree) {
    static const std::regex conditional(R"(^\s*#\s*(if|ifdef|ifndef|elif|else)\b.*)");
    static const std::regex guard(R"(^\s*#\s*ifndef\s+(\w+)\s*)");
    return everyLine(tree, isApplication, [&](const auto& file, size_t line) -> std::optional<std::string> {
        const std::string& text = file.lines[line];
        if (!std::regex_match(text, conditional)) {
            return std::nullopt;
        }
        std::smatch name;
        const bool defines = std::regex_match(text, name, guard) && line + 1 < file.lines.size() &&
                             startsWith(file.lines[line + 1], "#define " + name[1].str());
        return defines ? std::nullopt : std::optional<std::string>("compiles differently in different places");
    });
}

Violations applicationKnowsOfNoWorkstation(const SourceTree& tree) {
    static const std::regex word(
        R"(\b(workstations?|desktops?|debian|linux|headless|x11|wayland|tests?|unittests?|testing|benchmarks?|)"
        R"(gtest|gmock|fixtures?)(\b|_))",
        std::regex::icase);
    return everyLine(tree, isOfTheApplication, [&](const auto& file, size_t line) -> std::optional<std::string> {
        std::smatch match;
        if (!std::regex_search(file.lines[line], match, word)) {
            return std::nullopt;
        }
        return "says \"" + match[1].str() + "\", which a device does not know";
    });
}

Violations fixedPathsStandInOneHeader(const SourceTree& tree) {
    const auto concerns = [](const SourceFile& file) { return isApplication(file) && file.path != "inc/KestPaths.h"; };
    static const std::regex path(R"((^|[^\w.])/(opt|usr|etc|var|home|root|run|srv|tmp|proc|sys|dev)/)");
    return everyLine(tree, concerns, [](const auto& file, size_t line) -> std::optional<std::string> {
        if (!std::regex_search(file.lines[line], path)) {
            return std::nullopt;
        }
        return "has a fixed path of the device; inc/KestPaths.h is its place";
    });
}

Violations platformKnowsNoApplication(const SourceTree& tree) {
    static const std::regex word(R"(kest|\btips?\b)", std::regex::icase);
    static const std::regex allowed(R"(\bKEST_DEVICE\b)");
    const auto concerns = [](const SourceFile& file) { return startsWith(file.path, "platform/"); };
    return everyLine(tree, concerns, [](const auto& file, size_t line) -> std::optional<std::string> {
        const std::string text = std::regex_replace(file.lines[line], allowed, "");
        std::smatch match;
        if (!std::regex_search(text, match, word)) {
            return std::nullopt;
        }
        return "says \"" + match[0].str() + "\"; the platform knows no application";
    });
}

Violations layersPointDown(const SourceTree& tree) {
    static const std::regex inLayer(R"(platform/([^/]+)/.*)");
    const auto headers = publicHeaders(tree);
    const auto concerns = [](const SourceFile& file) { return startsWith(file.path, "platform/") && isSource(file); };
    return everyLine(tree, concerns, [&](const auto& file, size_t line) -> std::optional<std::string> {
        const auto header = included(file.lines[line]);
        if (!header) {
            return std::nullopt;
        }
        std::smatch match;
        std::regex_match(file.path, match, inLayer);
        const std::string name = match[1];
        const auto layer = layers().find(name);
        if (layer == layers().end()) {
            return name + " is a layer that the rule about layers does not name";
        }
        if (header->find("..") != std::string::npos) {
            return "includes " + *header + " past the include folders";
        }
        if (isWidgetHeader(*header) && !layer->second.hasWidgets) {
            return name + " includes " + *header + ", and has no widgets";
        }
        const auto found = headers.find(*header);
        if (found == headers.end() || found->second == name || layer->second.beneath.count(found->second) != 0) {
            return std::nullopt;
        }
        return name + " includes " + *header + " of " + found->second + ", which is not beneath it";
    });
}

Violations filesHaveOneJob(const SourceTree& tree) {
    const size_t most = 320;
    Violations violations;
    for (const SourceFile& file : tree) {
        if (isSource(file) && file.lines.size() > most) {
            violations.push_back(file.path + ": has " + std::to_string(file.lines.size()) +
                                 " lines; it has more than one job above " + std::to_string(most));
        }
    }
    return violations;
}

}  // namespace architecture
