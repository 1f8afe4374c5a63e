#pragma once

#include <string>

/// Reports to the platform's usage-log service which tips were used. Failures are ignored.
class KestUsageLog {
public:
    /// A menu was chosen in the main list ("KT01").
    static void menuChosen(const std::string& menuTitle);
    /// A launch request opened a menu ("KT03").
    static void menuRequested(const std::string& menuTitle);
    /// A demonstration's reply button was pressed ("KT02").
    static void replyPressed();
};
