#pragma once

#include <dlfcn.h>

namespace efl_answers {

/// EFL's own definition of a function that we define ahead of it; null when EFL has none.
template <typename Function>
Function* original(const char* name) {
    return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

}  // namespace efl_answers
