#pragma once

#include <cstdio>
#include <exception>

namespace remote_control {

/// Runs `work` at an edge to C, where no exception may pass; one that would is said on standard error.
template <typename Work>
void guarded(Work&& work) noexcept {
    try {
        work();
    } catch (const std::exception& error) {
        std::fprintf(stderr, "remote control: %s\n", error.what());
    }
}

}  // namespace remote_control
