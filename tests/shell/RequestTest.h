#pragma once

#include "ShellTest.h"

#include <string>
#include <utility>
#include <vector>

/// Launch requests to the application, as another application sends them.
class RequestTest : public ShellTest {
protected:
    using Extras = std::vector<std::pair<std::string, std::string>>;

    static constexpr char clockId[] = "com.example.clock";
    static constexpr char doorId[] = "com.example.door";
    static constexpr char file[] = "KestApp.cpp";

    /// A tip about the clock between two about the door, and a third about the door at the end.
    void writeCatalogue() const;

    /// Starts the application without a first view; it takes requests afterwards.
    void startWithoutView();

    /// A request while the application runs, and what it sets off.
    void request(const Extras& extras);
    /// The same, without a turn of the main loop afterwards.
    void requestAtOnce(const Extras& extras, bool first = false);

    /// The classes of the views on the naviframe, the lowest first.
    std::vector<std::string> views();
    /// What stands in their title bars: "Tips 2/4".
    std::vector<std::string> titles();
    /// The codes and the extras of the usage records: "KT03 Clock".
    std::vector<std::string> usage() const;
    /// Lines of the application object since the last look.
    std::vector<kest_log::Line> newLines();

    static kest_log::Line begin() { return kest_log::begin(file, "onAppControl"); }
    static kest_log::Line info(const std::string& message) { return kest_log::info(file, "onAppControl", message); }
    static kest_log::Line missing(const std::string& extra) {
        return info("app_control_get_extra_data() " + extra + " Failed");
    }

private:
    std::vector<Elm_Object_Item*> items();
};
