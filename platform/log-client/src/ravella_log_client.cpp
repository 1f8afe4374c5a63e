#include "ravella-log-client.h"

#include "Service.h"
#include "device/MainLoop.h"

#include <Ecore.h>

#include <list>
#include <memory>
#include <string_view>
#include <utility>
#include <vector>

namespace {

/// A callback that the main loop has yet to make.
struct Answer {
    ravella_log_manager_h manager;
    ravella_log_insert_cb callback;
    void* userData;
    int requestId;
    Ecore_Job* job;
};

std::vector<std::pair<std::string, std::string>> stringsOf(bundle* record) {
    std::vector<std::pair<std::string, std::string>> strings;
    const auto collect = [](const char* key, const char* value, void* all) {
        static_cast<decltype(strings)*>(all)->emplace_back(key, value);
    };
    bundle_foreach_str(record, collect, &strings);
    return strings;
}

bool isContentUri(const char* uri) {
    return uri && std::string_view(uri).rfind("content://", 0) == 0;
}

}  // namespace

struct ravella_log_manager_s {
    ravella_log_manager_s() = default;
    ~ravella_log_manager_s() {
        for (const Answer& answer : answers_)
            ecore_job_del(answer.job);
    }
    ravella_log_manager_s(const ravella_log_manager_s&) = delete;
    ravella_log_manager_s& operator=(const ravella_log_manager_s&) = delete;

    void answerLater(ravella_log_insert_cb callback, void* userData, int requestId) {
        answers_.push_back({this, callback, userData, requestId, nullptr});
        answers_.back().job = ecore_job_add(give, &answers_.back());
    }

private:
    static void give(void* data) {
        const Answer answer = *static_cast<Answer*>(data);
        // The callback may destroy the manager, so nothing of it is used after the call.
        answer.manager->answers_.remove_if([data](const Answer& waiting) { return &waiting == data; });
        answer.callback(answer.requestId, TIZEN_ERROR_NONE, answer.userData);
    }

    std::list<Answer> answers_;
};

int ravella_log_manager_create(ravella_log_manager_h* handle) {
    return service::callOnDevice("ravella_log_manager_create", [&](device::Device&) -> int {
        if (!handle)
            return TIZEN_ERROR_INVALID_PARAMETER;
        *handle = std::make_unique<ravella_log_manager_s>().release();
        return TIZEN_ERROR_NONE;
    });
}

int ravella_log_manager_insert(ravella_log_manager_h handle, const char* uri, bundle* record,
                               ravella_log_insert_cb callback, void* user_data, int* request_id) {
    return service::callOnDevice("ravella_log_manager_insert", [&](device::Device& device) -> int {
        if (!handle || !isContentUri(uri) || !record)
            return TIZEN_ERROR_INVALID_PARAMETER;
        if (callback)
            device::startMainLoop();
        const auto id = static_cast<int>(device.usage().append(uri, stringsOf(record)));
        if (request_id)
            *request_id = id;
        if (callback)
            handle->answerLater(callback, user_data, id);
        return TIZEN_ERROR_NONE;
    });
}

int ravella_log_manager_destroy(ravella_log_manager_h handle) {
    return service::call("ravella_log_manager_destroy", [&]() -> int {
        const std::unique_ptr<ravella_log_manager_s> owned(handle);
        return owned ? TIZEN_ERROR_NONE : TIZEN_ERROR_INVALID_PARAMETER;
    });
}
