#pragma once

#include <string>

/// One tip menu of the catalogue. A plain value: the views take copies.
struct KestContentInfo {
    std::string path;          ///< detail file, relative to the shared resource directory of `appid`
    std::string appid;         ///< the application that the tip is about
    bool isAvailable = false;  ///< offered in the device's region
    std::string menuTitle;     ///< translated
    std::string titleId;       ///< string id of the title when it was translated by id
    std::string textContents;  ///< marked-up text: cleaned, translated, with attachments and absolute paths
    std::string imagePath;     ///< absolute path of the first picture
    std::string textdomain;    ///< gettext domain of this menu's texts
    std::string iconPath;      ///< icon of `appid`, or "No icon Path"; empty for an empty `appid`
    std::string appName;       ///< translated name of the application
    std::string launchAppid;   ///< application that the text's link opens; empty: `appid`
    std::string launchParamKey;
    std::string launchParamValue;
};
