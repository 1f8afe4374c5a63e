#include "TreeText.h"

namespace tool {

namespace {

/// Writes one line for people after the other.
class Writer {
public:
    explicit Writer(std::string& text) : text_(text) {}

    void line(int depth, const std::string& words, bool visible = true) {
        text_.append(static_cast<std::size_t>(depth) * 2, ' ');
        text_ += visible ? words : "(" + words + ")";
        text_ += '\n';
    }

    void element(int depth, const Json& element);

private:
    void contents(int depth, const Json& element);

    std::string& text_;
};

std::string placeOf(const Json& thing) {
    return std::to_string(thing.value("x", 0)) + "," + std::to_string(thing.value("y", 0)) + " " +
           std::to_string(thing.value("width", 0)) + "x" + std::to_string(thing.value("height", 0));
}

std::string quoted(const std::string& text) {
    return '"' + oneLine(text) + '"';
}

void append(std::string& words, const std::string& more) {
    if (!more.empty()) {
        words += " " + more;
    }
}

Json listIn(const Json& element, const char* key) {
    return element.value(key, Json::array());
}

/// The parts of widgets are always the same ones.
std::string inPart(const Json& element) {
    const std::string part = element.value("part", "");
    return part.empty() || part.starts_with("elm.") ? "" : "in " + part;
}

std::string pageOf(const Json& element) {
    const int page = element.value("page", 0);
    return page == 0 ? "" : "page " + std::to_string(page) + " of " + std::to_string(element.value("pages", 0));
}

/// The parts that look otherwise than at first, and how.
std::string statesOf(const Json& element) {
    std::string words;
    for (const Json& part : listIn(element, "parts")) {
        const std::string state = part.value("state", "");
        if (state != "default") {
            words += (words.empty() ? "" : " ") + part.value("part", "") + "=" + state;
        }
    }
    return words;
}

void Writer::element(int depth, const Json& element) {
    std::string words = element.value("type", "");
    append(words, element.value("name", ""));
    append(words, placeOf(element));
    append(words, element.value("group", ""));
    append(words, element.value("file", ""));
    append(words, inPart(element));
    append(words, pageOf(element));
    append(words, statesOf(element));
    line(depth, words, element.value("visible", false));
    contents(depth + 1, element);
}

void Writer::contents(int depth, const Json& element) {
    for (const Json& item : listIn(element, "items")) {
        line(depth, "item " + quoted(item.value("title", "")) +
                        (item.value("view", "").empty() ? "" : " " + item.value("view", "")) +
                        (item.value("top", false) ? " on top" : ""));
    }
    for (const Json& text : listIn(element, "texts")) {
        std::string words = quoted(text.value("text", ""));
        append(words, placeOf(text));
        append(words, text.value("part", ""));
        line(depth, words, text.value("visible", false));
    }
    for (const Json& row : listIn(element, "rows")) {
        line(depth, "row " + std::to_string(row.value("index", 0)) + " " + row.value("style", "") + " " + placeOf(row),
             row.value("visible", false));
        contents(depth + 1, row);
    }
    for (const Json& child : listIn(element, "children")) {
        this->element(depth, child);
    }
}

}  // namespace

std::string treeText(const Json& tree) {
    std::string text;
    Writer writer(text);
    writer.line(0, "window " + quoted(tree.value("title", "")) + " " + std::to_string(tree.value("width", 0)) + "x" +
                       std::to_string(tree.value("height", 0)));
    for (const Json& element : listIn(tree, "elements")) {
        writer.element(1, element);
    }
    return text;
}

}  // namespace tool
