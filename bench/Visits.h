#pragma once

#include "Measure.h"
#include "Pages.h"

#include <string>
#include <vector>

namespace bench {

/// What visits of one program told, one value a visit unless it says otherwise.
struct Visits {
    std::vector<double> framesToPage;
    std::vector<Cost> tapToPage;
    /// For each visit, of each page but the chosen one.
    std::vector<std::vector<Cost>> filled;
    std::vector<Cost> other;
    /// For each visit, of each frame.
    std::vector<std::vector<Cost>> swipe;
    std::vector<std::vector<Cost>> scroll;
    std::vector<double> residentMegabytes;
    std::vector<double> peakMegabytes;
};

/// Opens the page of that menu in the program, and when `isWhole` goes on through all of it. Adds to `visits`. Throws
/// std::runtime_error when the program did not do as it should.
void visit(const std::vector<std::string>& program, const std::vector<Page>& pages, size_t menu, bool isWhole,
           Visits& visits);

}  // namespace bench
