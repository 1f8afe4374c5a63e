#include "Visits.h"

#include "Program.h"
#include "Visit.h"

#include <algorithm>
#include <cstdlib>
#include <sstream>
#include <stdexcept>

namespace bench {
namespace {

void describe(const std::vector<Page>& pages, size_t menu, bool isWhole) {
    const auto tall = std::find_if(pages.begin(), pages.end(), [](const Page& page) { return page.isTall(); });
    if (tall == pages.end()) {
        throw std::runtime_error("the catalogue has no tall picture");
    }
    const auto set = [](const char* name, const std::string& value) { setenv(name, value.c_str(), 1); };
    set(pictureVariable, pages.at(menu).pictures.front().file);
    set(menuVariable, std::to_string(menu));
    set(pagesVariable, std::to_string(pages.size()));
    set(tallPictureVariable, isWhole ? tall->pictures.front().file : "");
    set(tallPageVariable, std::to_string(tall - pages.begin()));
}

void take(const std::string& line, Visits& visits) {
    std::istringstream words(line);
    std::string what;
    words >> what;
    Cost cost;
    if (what == drawnLine) {
        double frames = 0;
        words >> frames >> cost.passed >> cost.processor;
        visits.framesToPage.push_back(frames);
        visits.tapToPage.push_back(cost);
    } else if (what == memoryLine) {
        words >> visits.residentMegabytes.emplace_back() >> visits.peakMegabytes.emplace_back();
    } else {
        words >> cost.passed >> cost.processor;
        if (what == otherLine) {
            visits.other.push_back(cost);
        } else {
            auto& all = what == filledLine ? visits.filled : what == swipeLine ? visits.swipe : visits.scroll;
            all.back().push_back(cost);
        }
    }
    if (!words) {
        throw std::runtime_error("not understood: " + line);
    }
}

}  // namespace

void visit(const std::vector<std::string>& program, const std::vector<Page>& pages, size_t menu, bool isWhole,
           Visits& visits) {
    describe(pages, menu, isWhole);
    std::istringstream told(toldBy(program, VISIT));
    for (auto* each : {&visits.filled, &visits.swipe, &visits.scroll}) {
        each->emplace_back();
    }
    for (std::string line; std::getline(told, line);) {
        take(line, visits);
    }
}

}  // namespace bench
