#include "KestApp.h"
#include "KestLog.h"

int main(int argc, char** argv) {
    KEST_BEGIN();
    KestApp app;
    const int result = app.start(argc, argv);
    KEST_INFO("app return=%d", result);
    return result;
}
