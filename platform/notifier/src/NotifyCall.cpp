#include "NotifyCall.h"

#include <initializer_list>

namespace {

constexpr int daemonsOwnTime = -1;

std::string markupOf(const std::string& text) {
    std::string markup;
    for (const char character : text) {
        switch (character) {
        case '&':
            markup += "&amp;";
            break;
        case '<':
            markup += "&lt;";
            break;
        case '>':
            markup += "&gt;";
            break;
        default:
            markup += character;
        }
    }
    return markup;
}

void appendTexts(Eldbus_Message_Iter* list, std::initializer_list<const char*> texts) {
    for (const char* text : texts)
        eldbus_message_iter_basic_append(list, 's', text);
}

void appendHint(Eldbus_Message_Iter* hints, const char* name, const std::string& value) {
    Eldbus_Message_Iter* entry = nullptr;
    eldbus_message_iter_arguments_append(hints, "{sv}", &entry);
    eldbus_message_iter_basic_append(entry, 's', name);
    Eldbus_Message_Iter* variant = eldbus_message_iter_container_new(entry, 'v', "s");
    eldbus_message_iter_basic_append(variant, 's', value.c_str());
    eldbus_message_iter_container_close(entry, variant);
    eldbus_message_iter_container_close(hints, entry);
}

}  // namespace

void NotifyCall::appendTo(Eldbus_Message* message) const {
    const std::string& title = appearance.title;
    const std::string content = asMarkup ? markupOf(appearance.content) : appearance.content;
    Eldbus_Message_Iter* arguments = eldbus_message_iter_get(message);
    Eldbus_Message_Iter* actions = nullptr;
    Eldbus_Message_Iter* hints = nullptr;
    eldbus_message_iter_arguments_append(arguments, "susssas", appearance.application.c_str(), replaces,
                                         appearance.icon.c_str(), title.c_str(), content.c_str(), &actions);
    // A daemon that lists the actions shows this name.
    if (isClickable)
        appendTexts(actions, {click, title.c_str()});
    eldbus_message_iter_container_close(arguments, actions);
    eldbus_message_iter_arguments_append(arguments, "a{sv}", &hints);
    appendHint(hints, "desktop-entry", appId);
    eldbus_message_iter_container_close(arguments, hints);
    eldbus_message_iter_basic_append(arguments, 'i', daemonsOwnTime);
}
