#pragma once

#include <map>
#include <string>

/// The folders of the applications' shared resources; each is asked for once.
class KestSharedResources {
public:
    /// With a slash at its end.
    const std::string& of(const std::string& appid);
    /// Asks anew from now on: applications come and go.
    void forget() { folders.clear(); }

private:
    std::map<std::string, std::string> folders;
};
