#pragma once

#include "ui/Clock.h"
#include "ui/Screen.h"
#include "ui/Toolkit.h"
#include "ui/Widgets.h"

#include <gtest/gtest.h>

namespace test_ui {

/// A test with EFL and, when it asks for one, a window.
class UiTest : public testing::Test {
protected:
    /// A shown window with an opaque background, made at the first call and deleted at the end.
    Evas_Object* window(int width = 720, int height = 1280);
    /// The finger, keys and picture of that window.
    Screen& screen();

    Toolkit toolkit_;

private:
    Evas_Object* window_ = nullptr;
    std::unique_ptr<Screen> screen_;
};

}  // namespace test_ui
