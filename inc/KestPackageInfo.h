#pragma once

#include <package_info.h>
#include <package_manager.h>

#include <string>

/// What the package manager knows of a package. Frees its handle with itself.
class KestPackageInfo {
public:
    /// How the platform looks a package up: package_info_create() or package_manager_get_package_info().
    using LookUp = int (*)(const char* package, package_info_h* info);

    KestPackageInfo(LookUp lookUp, const std::string& package) : info(nullptr), code(lookUp(package.c_str(), &info)) {}
    ~KestPackageInfo() { package_info_destroy(info); }
    KestPackageInfo(const KestPackageInfo&) = delete;
    KestPackageInfo& operator=(const KestPackageInfo&) = delete;

    /// What the look-up returned; the rest is only for PACKAGE_MANAGER_ERROR_NONE.
    int result() const { return code; }
    package_info_h handle() const { return info; }

private:
    package_info_h info;
    int code;
};
