#pragma once

#include <Elementary.h>
#include <package_manager.h>
#include <ui_extension.h>

#include <functional>
#include <map>
#include <string>
#include <vector>

/// What the application asked of EFL and the platform, as far as its effect cannot be seen. The calls go through.
namespace calls {

/// A row that was appended to the list.
struct Row {
    const Elm_Genlist_Item_Class* itemClass;
    const void* data;
    const Elm_Object_Item* parent;
    Evas_Smart_Cb select;
    const void* selectData;
    Elm_Genlist_Item_Type type;
};

struct Made {
    bool failGenlist = false;  ///< elm_genlist_add() gives nothing
    bool outOfMemory = false;  ///< clearing and updating the list, and selecting a row, throw std::bad_alloc
    std::vector<Row> rows;
    int clears = 0;
    int updates = 0;
    /// Which calls filled the list and its title, in order: "row", "title", "package manager".
    std::vector<std::string> steps;
    std::function<void()> whenPopped;  ///< called before each pop of the naviframe
    std::vector<std::string> themeExtensions;
    /// Texts that follow the language: "<part>: <id> of <domain>".
    std::vector<std::string> translatableTexts;
    std::function<void()> whenRecorded;                   ///< called before each usage record is written
    std::map<std::string, Evas_Smart_Cb> smartCallbacks;  ///< by event, the last one
    uxt_theme_changed_cb themeCallback = nullptr;
    package_manager_event_cb packageCallback = nullptr;
    /// Registrations and their ends, in order: "theme +", "theme -", "package create", "package set", ...
    std::vector<std::string> registrations;
};

/// Of this process.
Made& made();

}  // namespace calls
