#include "KestUsageLog.h"

#include "KestPaths.h"

#include <ravella-log-client.h>

namespace {

const char featureSurvey[] = "content://com.ravella.logprovider/log/use_app_feature_survey";

/// `extra` null: the record has none.
void insertRecord(const char* feature, const std::string* extra) {
    ravella_log_manager_h manager = nullptr;
    ravella_log_manager_create(&manager);

    bundle* record = bundle_create();
    bundle_add_str(record, "app_id", KEST_APP_ID);
    bundle_add_str(record, "feature", feature);
    if (extra) {
        bundle_add_str(record, "extra", extra->c_str());
    }
    int requestId = 0;
    ravella_log_manager_insert(manager, featureSurvey, record, nullptr, nullptr, &requestId);

    bundle_free(record);
    ravella_log_manager_destroy(manager);
}

}  // namespace

void KestUsageLog::menuChosen(const std::string& menuTitle) {
    insertRecord("KT01", &menuTitle);
}

void KestUsageLog::menuRequested(const std::string& menuTitle) {
    insertRecord("KT03", &menuTitle);
}

void KestUsageLog::replyPressed() {
    insertRecord("KT02", nullptr);
}
