#pragma once

#include <map>
#include <string>

/// The folders of the applications' shared resources; each is asked for until the device tells it.
class KestSharedResources {
public:
    /// With a slash at its end; this application's own while the device does not tell it.
    std::string of(const std::string& appid);
    /// Asks anew from now on: applications come and go.
    void forget() { folders.clear(); }

private:
    std::map<std::string, std::string> folders;
};
