#include "device/Faults.h"

#include "device/Device.h"
#include "support/Environment.h"
#include "support/Message.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

namespace faults = device::faults;
using support::messageOf;
using testing::ElementsAre;
using testing::Optional;

class Faults : public testing::Test {
protected:
    ~Faults() override { faults::clear(); }

    /// What `count` calls of the service get; 0 stands for a call that goes through.
    static std::vector<int> taken(const char* service, int count) {
        std::vector<int> errors;
        for (int call = 0; call < count; ++call)
            errors.push_back(faults::take(service).value_or(0));
        return errors;
    }
};

TEST_F(Faults, AreNoneUntilTheyArePlanned) {
    EXPECT_EQ(faults::take("preference_set_string"), std::nullopt);
}

TEST_F(Faults, StrikeOnceUnlessMoreIsSaid) {
    faults::plan("preference_set_string", -5);
    EXPECT_THAT(taken("preference_set_string", 3), ElementsAre(-5, 0, 0));
}

TEST_F(Faults, StrikeTheNamedServiceOnly) {
    faults::plan("preference_set_string", -5);
    EXPECT_THAT(taken("preference_get_string", 2), ElementsAre(0, 0));
    EXPECT_THAT(taken("preference_set", 1), ElementsAre(0));
    EXPECT_THAT(faults::take("preference_set_string"), Optional(-5));
}

TEST_F(Faults, LetSomeCallsThroughFirst) {
    faults::plan("dlog_print", -1, 2, 3);
    EXPECT_THAT(taken("dlog_print", 7), ElementsAre(0, 0, 0, -1, -1, 0, 0));
}

TEST_F(Faults, AreReplacedByANewPlanAndForgotten) {
    faults::plan("dlog_print", -1, 9);
    faults::plan("dlog_print", -2);
    EXPECT_THAT(taken("dlog_print", 2), ElementsAre(-2, 0));
    faults::plan("dlog_print", -1, 9);
    faults::plan("dlog_print", -1, 0);
    EXPECT_THAT(taken("dlog_print", 1), ElementsAre(0));
    faults::plan("dlog_print", -1, 9);
    faults::clear();
    EXPECT_THAT(taken("dlog_print", 1), ElementsAre(0));
}

TEST_F(Faults, AreReadFromText) {
    faults::planFromText("one=-5,two=-12x2,three=7+1,four=-1x2+1");
    EXPECT_THAT(taken("one", 2), ElementsAre(-5, 0));
    EXPECT_THAT(taken("two", 3), ElementsAre(-12, -12, 0));
    EXPECT_THAT(taken("three", 3), ElementsAre(0, 7, 0));
    EXPECT_THAT(taken("four", 4), ElementsAre(0, -1, -1, 0));
}

TEST_F(Faults, InFaultyTextAreRefusedByTheirWord) {
    for (const char* word : {"one", "=5", "one=", "one=x2", "one=5x", "one=5x0", "one=5x-1", "one=5+", "one=5+-1",
                             "one=5y2", "one=5x2+1z", "one=99999999999", ""})
        EXPECT_EQ(messageOf([&] { faults::planFromText(std::string("fine=1,") + word + ",later=1"); }),
                  "DEVICE_FAULTS: \"" + std::string(word) +
                      "\" is no planned failure; write NAME=ERROR, NAME=ERRORxCOUNT or NAME=ERRORxCOUNT+SKIP");
}

TEST_F(Faults, OfTheEnvironmentAreReadWhenTheDeviceIsOpened) {
    const support::TemporaryFolder folder;
    const support::Environment named("KEST_DEVICE", folder.path().string());
    const support::Environment planned("DEVICE_FAULTS", "vconf_get_str=-1");
    device::Device::setCurrent(nullptr);
    device::Device::current();
    EXPECT_THAT(faults::take("vconf_get_str"), Optional(-1));
    device::Device::setCurrent(nullptr);
}

}  // namespace
