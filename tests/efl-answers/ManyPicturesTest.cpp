#include "TextPicture.h"

#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

namespace {

class ManyPictures : public test_ui::UiTest {
protected:
    /// Asks for a picture that is missing.
    void ask(int number) {
        const std::string href = "file:/" + (device_.folder() / (std::to_string(number) + ".png")).string();
        evas_object_del(efl_answers::textPicture(evas_object_evas_get(window()), href.c_str()));
    }

    support::TemporaryDevice device_;
};

TEST_F(ManyPictures, ThatAreMissingLeaveNoMoreThanAHundredLines) {
    for (int number = 0; number < 99; ++number)
        ask(number);
    EXPECT_EQ(99U, device_.logMessages().size());
    for (int number = 99; number < 200; ++number)
        ask(number);
    EXPECT_EQ(100U, device_.logMessages().size());
}

}  // namespace
