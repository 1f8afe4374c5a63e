#pragma once

#include <functional>
#include <string>

/// While it lives, this process's renamings go wrong as a test wants it. One at a time.
class RefusedRename {
public:
    /// Those of paths that `refuses` names are not permitted.
    explicit RefusedRename(std::function<bool(const std::string& from)> refuses, bool canExchange = true);
    ~RefusedRename();
    RefusedRename(const RefusedRename&) = delete;
    RefusedRename& operator=(const RefusedRename&) = delete;

    /// The error that a renaming ends with; 0 for none. `exchange`: two are to change places, which not every file
    /// system can do.
    int errorOf(const std::string& from, bool exchange) const;

private:
    std::function<bool(const std::string&)> refuses_;
    bool canExchange_;
};
