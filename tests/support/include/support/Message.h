#pragma once

#include "device/Error.h"

#include <string>

namespace support {

/// What the Error says that `work` throws; "no error" when it throws none.
template <class Work>
std::string messageOf(Work&& work) {
    try {
        work();
    } catch (const device::Error& error) {
        return error.what();
    }
    return "no error";
}

}  // namespace support
