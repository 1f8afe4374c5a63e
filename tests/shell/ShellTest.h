#pragma once

#include "Calls.h"

#include "kest/KestUiTest.h"
#include "kest/Texts.h"

#include <gmock/gmock.h>

/// The application's shell: its object, its common services and its usage records.
class ShellTest : public KestUiTest {
protected:
    std::string resource(const std::string& id) const { return (device().appRoot() / "res" / id).string(); }
};
