#include "bundle.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace {

using testing::ElementsAre;

class Bundle : public testing::Test {
protected:
    ~Bundle() override { bundle_free(made); }

    std::string value(const char* key) const {
        char* text = nullptr;
        EXPECT_EQ(bundle_get_str(made, key, &text), BUNDLE_ERROR_NONE);
        return text ? text : "NULL";
    }

    bundle* made = bundle_create();
};

TEST_F(Bundle, GivesBackWhatWasAdded) {
    EXPECT_EQ(bundle_add_str(made, "key", "value"), BUNDLE_ERROR_NONE);
    EXPECT_EQ(bundle_add_str(made, "empty", ""), BUNDLE_ERROR_NONE);
    EXPECT_EQ(bundle_add_str(made, "bytes", "\xff\n\""), BUNDLE_ERROR_NONE);
    EXPECT_EQ(value("key"), "value");
    EXPECT_EQ(value("empty"), "");
    EXPECT_EQ(value("bytes"), "\xff\n\"");
}

TEST_F(Bundle, KeepsItsFirstValueOfAKey) {
    bundle_add_str(made, "key", "first");
    EXPECT_EQ(bundle_add_str(made, "key", "second"), BUNDLE_ERROR_KEY_EXISTS);
    EXPECT_EQ(value("key"), "first");
}

TEST_F(Bundle, SaysThatAKeyIsMissing) {
    char* text = nullptr;
    EXPECT_EQ(bundle_get_str(made, "key", &text), BUNDLE_ERROR_KEY_NOT_AVAILABLE);
    EXPECT_EQ(text, nullptr);
}

TEST_F(Bundle, VisitsItsStringsInTheOrderOfTheirKeys) {
    bundle_add_str(made, "b", "2");
    bundle_add_str(made, "a", "1");
    std::vector<std::string> visited;
    bundle_foreach_str(
        made,
        [](const char* key, const char* text, void* all) {
            static_cast<std::vector<std::string>*>(all)->push_back(std::string(key) + "=" + text);
        },
        &visited);
    EXPECT_THAT(visited, ElementsAre("a=1", "b=2"));
}

TEST_F(Bundle, MayGrowWhileItIsVisited) {
    bundle_add_str(made, "a", "1");
    bundle_foreach_str(
        made, [](const char*, const char*, void* same) { bundle_add_str(static_cast<bundle*>(same), "b", "2"); }, made);
    EXPECT_EQ(value("b"), "2");
}

TEST_F(Bundle, RefusesNullAndEmptyKeys) {
    char* text = nullptr;
    EXPECT_EQ(bundle_add_str(nullptr, "key", "value"), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_add_str(made, nullptr, "value"), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_add_str(made, "", "value"), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_add_str(made, "key", nullptr), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_get_str(nullptr, "key", &text), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_get_str(made, nullptr, &text), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_get_str(made, "", &text), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_get_str(made, "key", nullptr), BUNDLE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(bundle_free(nullptr), BUNDLE_ERROR_INVALID_PARAMETER);
    bundle_foreach_str(nullptr, nullptr, nullptr);
    bundle_foreach_str(made, nullptr, nullptr);
}

}  // namespace
