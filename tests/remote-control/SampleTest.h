#pragma once

#include "Element.h"
#include "SampleWindow.h"
#include "device/Error.h"
#include "ui/UiTest.h"

#include <gmock/gmock.h>

#include <functional>
#include <optional>
#include <string>

/// A test that looks at the sample's window, 720x1280, on the test's own clock.
class SampleTest : public test_ui::UiTest {
protected:
    void SetUp() override {
        elm_win_title_set(window(), "Sample");
        sample_.emplace(window(), "Fruits");
        test_ui::runFor(1);
    }

    std::vector<remote_control::Element> read() { return remote_control::readScreen(window()); }

    /// The message of the error that `work` throws.
    static std::string errorOf(const std::function<void()>& work) {
        try {
            work();
        } catch (const device::Error& error) {
            return error.what();
        }
        return "no error";
    }

    /// The first element of that type, in the order of the tree; a default one when there is none.
    static remote_control::Element find(const std::vector<remote_control::Element>& elements, const std::string& type) {
        for (const remote_control::Element& element : elements) {
            if (element.type == type) {
                return element;
            }
            if (remote_control::Element below = find(element.children, type); !below.type.empty()) {
                return below;
            }
        }
        return {};
    }

    std::optional<sample::SampleWindow> sample_;
};
