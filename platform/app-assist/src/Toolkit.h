#pragma once

#include <device/Device.h>

namespace app_assist {

/// EFL as the device has it: its files in the device's folder, the touch profile, the display's scale. Runs from
/// its making to its end.
class Toolkit {
public:
    enum class Messages {
        InLog,  ///< EFL's own errors go to the device's log: on the terminal they would drown the application's lines
        AsTheyAre  ///< whoever runs the application looks after them
    };

    Toolkit(const device::Device& device, Messages messages, int argc, char** argv);
    ~Toolkit();
    Toolkit(const Toolkit&) = delete;
    Toolkit& operator=(const Toolkit&) = delete;

private:
    Messages messages_;
};

}  // namespace app_assist
