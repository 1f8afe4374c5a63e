#include "app-assist/WApp.h"
#include "app-assist/WPageSlideView.h"

#include <gmock/gmock.h>

#include <cstring>
#include <vector>

// Applications are built against these classes apart from the framework: where an operation stands among the virtual
// ones is part of what they were built against.

namespace {

using testing::ElementsAre;

/// The place of a virtual operation in its class's table, as every ABI of the Itanium kind keeps it in a pointer to
/// the operation: the offset in bytes, and 1 more where a virtual operation's pointer is told from a plain one's.
template <class Operation>
std::size_t place(Operation operation) {
    std::uintptr_t offset = 0;
    static_assert(sizeof operation >= sizeof offset, "a pointer to an operation begins with its offset");
    std::memcpy(&offset, &operation, sizeof offset);
    return (offset - 1) / sizeof(void*);
}

/// Opens what only subclasses reach.
struct App : app_assist::WApp {
    static std::vector<std::size_t> places() {
        return {place(&App::onStart), place(&App::onCreate), place(&App::onTerminate),
                place(&App::onPause), place(&App::onResume), place(&App::onAppControl)};
    }
};

struct View : app_assist::WView {
    static std::vector<std::size_t> placesOfLife() {
        return {place(&View::create),   place(&View::destroy),   place(&View::getEvasObj), place(&View::getClassName),
                place(&View::onCreate), place(&View::onCreated), place(&View::onDestroy)};
    }
    static std::vector<std::size_t> placesOnNaviframe() {
        return {place(&View::onSetContainerProperties),
                place(&View::onPushToNaviframe),
                place(&View::onPushed),
                place(&View::onPop),
                place(&View::onBecomeTop),
                place(&View::onSetAsPageContent)};
    }
};

struct Pager : app_assist::WPageSlideView {
    static std::vector<std::size_t> places() { return {place(&Pager::onCreateLayout), place(&Pager::onInitScroller)}; }
};

TEST(VirtualOrder, OfAnApplicationIsItsDestructorsAndItsLifeCycle) {
    EXPECT_THAT(App::places(), ElementsAre(2, 3, 4, 5, 6, 7));
}

TEST(VirtualOrder, OfAViewIsThatOfAnyObjectWithItsDestructorsAndThenItsLife) {
    EXPECT_THAT(View::placesOfLife(), ElementsAre(0, 1, 2, 5, 6, 7, 8));
}

TEST(VirtualOrder, OfAViewGoesOnWithWhatTheNaviframeAsks) {
    EXPECT_THAT(View::placesOnNaviframe(), ElementsAre(9, 10, 11, 12, 13, 14));
}

TEST(VirtualOrder, OfAPagerEndsWithItsOwn) {
    EXPECT_THAT(Pager::places(), ElementsAre(15, 16));
}

}  // namespace
