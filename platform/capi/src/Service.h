#pragma once

#include "device/Device.h"
#include "device/Faults.h"
#include "tizen_error.h"

#include <cstdlib>
#include <cstring>
#include <exception>
#include <new>
#include <optional>
#include <string>

/// What every C service is made of: the edge at which exceptions become error codes.
namespace service {

/// Writes one error line to the device's log, the first time that this process meets the failure.
void report(const std::exception& failure) noexcept;

/// Runs `body` and returns its code; a planned failure of the function `name` comes first. Nothing is thrown.
template <class Body>
int call(const char* name, Body&& body) noexcept {
    try {
        const std::optional<int> planned = device::faults::take(name);
        return planned ? *planned : body();
    } catch (const std::bad_alloc&) {
        return TIZEN_ERROR_OUT_OF_MEMORY;
    } catch (const std::exception& failure) {
        report(failure);
        return TIZEN_ERROR_IO_ERROR;
    }
}

/// The same for a service that works on the device, which `body` is handed.
template <class Body>
int callOnDevice(const char* name, Body&& body) noexcept {
    // The device comes before the planned failures: opening it reads those that the environment plans.
    const int opened = call("", [] { return device::Device::current(), TIZEN_ERROR_NONE; });
    return opened != TIZEN_ERROR_NONE ? opened : call(name, [&] { return body(device::Device::current()); });
}

/// The number of an enumerator that a C caller gave, who may give any: C++ must not read one that its type cannot have.
template <class Enumerator>
int numberOf(const Enumerator& enumerator) noexcept {
    static_assert(sizeof(Enumerator) == sizeof(int));
    int number = 0;
    std::memcpy(&number, &enumerator, sizeof number);
    return number;
}

/// A copy for a C caller, who frees it with free(). Throws std::bad_alloc.
inline char* copyOf(const std::string& text) {
    auto* copy = static_cast<char*>(std::malloc(text.size() + 1));
    if (!copy)
        throw std::bad_alloc();
    std::memcpy(copy, text.c_str(), text.size() + 1);
    return copy;
}

}  // namespace service
