#include "bundle.h"

#include "Service.h"

#include <map>
#include <memory>

struct _bundle_t {
    std::map<std::string, std::string> strings;
};

bundle* bundle_create(void) {
    bundle* made = nullptr;
    service::call("bundle_create", [&]() -> int {
        made = std::make_unique<bundle>().release();
        return BUNDLE_ERROR_NONE;
    });
    return made;
}

int bundle_free(bundle* b) {
    return service::call("bundle_free", [&]() -> int {
        const std::unique_ptr<bundle> owned(b);
        return owned ? BUNDLE_ERROR_NONE : BUNDLE_ERROR_INVALID_PARAMETER;
    });
}

int bundle_add_str(bundle* b, const char* key, const char* str) {
    return service::call("bundle_add_str", [&]() -> int {
        if (!b || !key || !*key || !str)
            return BUNDLE_ERROR_INVALID_PARAMETER;
        return b->strings.try_emplace(key, str).second ? BUNDLE_ERROR_NONE : BUNDLE_ERROR_KEY_EXISTS;
    });
}

int bundle_get_str(bundle* b, const char* key, char** str) {
    return service::call("bundle_get_str", [&]() -> int {
        if (!b || !key || !*key || !str)
            return BUNDLE_ERROR_INVALID_PARAMETER;
        const auto found = b->strings.find(key);
        if (found == b->strings.end())
            return BUNDLE_ERROR_KEY_NOT_AVAILABLE;
        *str = found->second.data();
        return BUNDLE_ERROR_NONE;
    });
}

void bundle_foreach_str(bundle* b, bundle_str_iterator_t iterator, void* user_data) {
    service::call("bundle_foreach_str", [&]() -> int {
        if (!b || !iterator)
            return BUNDLE_ERROR_INVALID_PARAMETER;
        // The iterator may add to the bundle.
        const std::map<std::string, std::string> strings = b->strings;
        for (const auto& [key, value] : strings)
            iterator(key.c_str(), value.c_str(), user_data);
        return BUNDLE_ERROR_NONE;
    });
}
