#include "Tips.h"

#include "kest/CatalogueFiles.h"

#include <algorithm>
#include <stdexcept>

namespace tips {

namespace {

const std::string alarm = "com.example.alarm";
const std::string kest = "com.ravella.kest";

std::string translated(const std::string& name, Language language) {
    return language == Language::Korean ? named(name).korean : name;
}

}  // namespace

const std::vector<Tip>& all() {
    static const std::vector<Tip> tips = {
        {"Clock", "시계"},
        {"Alarm", "알람", alarm, "Global, India", "a_01.png"},
        {"Snooze", "다시 알림", alarm},
        {"Music", "음악", "com.example.music"},
        {"Weather", "날씨", "com.example.weather"},
        {"Mail", "메일"},
        {"Cricket", "크리켓", kest, "India"},
        {"Steps", "걸음"},
        {"Heart", "심박"},
        {"Notes", "메모"},
        {"Photos", "사진"},
        {"Torch", "손전등"},
        {"Power", "전원"},
    };
    return tips;
}

const Tip& named(const std::string& name) {
    const auto found = std::find_if(all().begin(), all().end(), [&](const Tip& tip) { return tip.name == name; });
    return found == all().end() ? throw std::invalid_argument(name) : *found;
}

std::vector<std::string> atFirst() {
    return {"Clock", "Alarm", "Snooze", "Music", "Mail", "Steps", "Heart", "Notes", "Photos", "Power"};
}

std::vector<std::string> without(std::vector<std::string> names, const std::string& name) {
    names.erase(std::remove(names.begin(), names.end(), name), names.end());
    return names;
}

std::vector<std::string> with(const std::vector<std::string>& names, const std::string& name) {
    std::vector<std::string> result;
    for (const Tip& tip : all())
        if (tip.name == name || std::count(names.begin(), names.end(), tip.name) > 0)
            result.push_back(tip.name);
    return result;
}

std::string title(const std::string& name, Language language) {
    return translated(name, language);
}

std::string application(const std::string& name, Language language) {
    return language == Language::Korean ? named(name).korean + " 앱" : "Application of " + name;
}

std::string text(const std::string& name, Language language) {
    return language == Language::Korean ? named(name).korean + " 사용법" : "How to use " + name;
}

std::string setting(Language language) {
    return language == Language::Korean ? "ko_KR.UTF-8" : "en_US.UTF-8";
}

std::string Tip::detail() const {
    return kest_files::detail(
        "<title id=\"IDS_TITLE_" + name + "\">-</title><appname id=\"IDS_APP_" + name +
        "\">-</appname><image>contents/" + picture + "</image>" +
        kest_files::contents(kest_files::textTag("IDS_TEXT_" + name) + "<br/><a href=app>" + appid + "</a>"));
}

std::string Tip::strings() const {
    std::vector<kest_files::String> values;
    for (const Language language : {Language::English, Language::Korean}) {
        const std::string region = setting(language).substr(0, 2);
        values.push_back({region, "IDS_TITLE_" + name, title(name, language)});
        values.push_back({region, "IDS_APP_" + name, application(name, language)});
        values.push_back({region, "IDS_TEXT_" + name, text(name, language)});
    }
    return kest_files::strings(values);
}

}  // namespace tips
