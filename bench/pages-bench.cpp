// What the pager and its pages cost beside a bare EFL program with a scroller that shows the same pictures and texts:
// a tap on a row until the page is drawn, each frame of a swipe and of the tall picture's scroll, filling the other
// pages, and memory. Whole processes that draw into memory, in turn, medians. Joins the bus of its environment as the
// application does: to be run under one of its own.

#include "Program.h"
#include "ShippedPages.h"
#include "Statistics.h"
#include "Visits.h"
#include "support/TemporaryFolder.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <stdexcept>
#include <string>

namespace {

using bench::Cost;
using bench::median;
using bench::Page;
using bench::quantile;
using bench::Visits;

/// The frames that cost the median, and what one in twenty exceeds, and the most of all.
constexpr double shares[] = {0.5, 0.95, 1};

struct Program {
    const char* name;
    std::vector<std::string> command;
    Visits whole;
    /// The one that opens the page with the tall picture, and one whose picture stands still.
    Visits tall;
    Visits still;
};

using Programs = std::array<Program, 2>;

std::vector<double> of(const std::vector<Cost>& costs, double Cost::*which) {
    std::vector<double> values;
    values.reserve(costs.size());
    for (const Cost& cost : costs) {
        values.push_back(cost.*which);
    }
    return values;
}

/// The median of what each visit gives.
double overVisits(const std::vector<std::vector<Cost>>& visits, double Cost::*which, double share) {
    std::vector<double> values;
    values.reserve(visits.size());
    for (const std::vector<Cost>& visit : visits) {
        values.push_back(quantile(of(visit, which), share));
    }
    return median(values);
}

void printOpening(const Programs& programs, const char* what, Visits Program::*which) {
    std::printf("\n%-38s %6s %6s %8s %6s %14s %6s\n", what, "frames", "most", "ms", "ratio", "processor ms", "ratio");
    const auto value = [&](const Program& program, double Cost::*cost) {
        return median(of((program.*which).tapToPage, cost));
    };
    for (const Program& program : programs) {
        const Visits& visits = program.*which;
        const double passed = value(program, &Cost::passed), processor = value(program, &Cost::processor);
        std::printf("%-38s %6.0f %6.0f %8.1f %6.2f %14.1f %6.2f\n", program.name, median(visits.framesToPage),
                    quantile(visits.framesToPage, 1), passed, passed / value(programs[0], &Cost::passed), processor,
                    processor / value(programs[0], &Cost::processor));
    }
}

void printFrames(const Programs& programs, const char* what, std::vector<std::vector<Cost>> Visits::*which) {
    for (const auto& [clock, cost] : {std::pair{"processor", &Cost::processor}, std::pair{"passed", &Cost::passed}}) {
        std::printf("\n%-38s %8s %6s %8s %6s %8s %6s\n", (std::string(what) + ", " + clock + " ms").c_str(), "median",
                    "ratio", "95th", "ratio", "worst", "ratio");
        for (const Program& program : programs) {
            std::printf("%-38s", program.name);
            for (const double share : shares) {
                const double value = overVisits(program.whole.*which, cost, share);
                std::printf(" %8.2f %6.2f", value, value / overVisits(programs[0].whole.*which, cost, share));
            }
            std::printf("\n");
        }
    }
}

void printMemory(const Programs& programs) {
    std::printf("\n%-38s %8s %6s %8s %6s\n", "pager open, all pages filled, MB", "resident", "ratio", "peak", "ratio");
    for (const Program& program : programs) {
        const double resident = median(program.whole.residentMegabytes), peak = median(program.whole.peakMegabytes);
        std::printf("%-38s %8.1f %6.2f %8.1f %6.2f\n", program.name, resident,
                    resident / median(programs[0].whole.residentMegabytes), peak,
                    peak / median(programs[0].whole.peakMegabytes));
    }
}

/// What the filling of the page at that place among the others takes, over all visits.
std::vector<Cost> fillingOf(const Visits& visits, size_t place) {
    std::vector<Cost> costs;
    for (const std::vector<Cost>& visit : visits.filled) {
        costs.push_back(visit.at(place));
    }
    return costs;
}

void printFilling(const Programs& programs, const std::vector<Page>& pages) {
    std::printf("\n%-38s %18s %18s %18s\n", "the main loop is held, ms (processor)", "bare pager", "application",
                "application, most");
    const auto row = [&](const char* name, const std::vector<Cost>& bare, const std::vector<Cost>& application) {
        std::printf("%-38s %8.2f (%7.2f) %8.2f (%7.2f) %8.2f (%7.2f)\n", name, median(of(bare, &Cost::passed)),
                    median(of(bare, &Cost::processor)), median(of(application, &Cost::passed)),
                    median(of(application, &Cost::processor)), quantile(of(application, &Cost::passed), 1),
                    quantile(of(application, &Cost::processor), 1));
    };
    for (size_t place = 0; place + 1 < pages.size(); ++place) {
        const Page& page = pages[place + 1];
        const std::string name = "page " + std::to_string(place + 2) +
                                 ", pictures: " + std::to_string(page.pictures.size()) +
                                 (page.isTall() ? ", tall" : "");
        row(name.c_str(), fillingOf(programs[0].whole, place), fillingOf(programs[1].whole, place));
    }
    row("any other turn of the loop, longest", programs[0].whole.other, programs[1].whole.other);
}

void print(const Programs& programs, const std::vector<Page>& pages) {
    printOpening(programs, "tap to the page drawn, a sequence", &Program::whole);
    printOpening(programs, "tap to the page drawn, a tall picture", &Program::tall);
    printOpening(programs, "tap to the page drawn, one picture", &Program::still);
    printFrames(programs, "frames of a swipe", &Visits::swipe);
    printFrames(programs, "frames of the tall scroll", &Visits::scroll);
    printMemory(programs);
    printFilling(programs, pages);
}

size_t menuOf(const std::vector<Page>& pages, const std::function<bool(const Page&)>& isIt) {
    const auto found = std::find_if(pages.begin(), pages.end(), isIt);
    if (found == pages.end()) {
        throw std::runtime_error("the catalogue has no page of some kind");
    }
    return static_cast<size_t>(found - pages.begin());
}

int run(int rounds) {
    const support::TemporaryFolder folder;
    bench::prepareEnvironment(folder.path());
    // A frame's work is all on one thread then, and in the frame's time.
    setenv("ECORE_EVAS_FORCE_SYNC_RENDER", "1", 1);
    const std::vector<Page> pages = bench::shippedPages();
    const auto pagesFile = folder.path() / "pages";
    bench::writePages(pagesFile, pages);
    const size_t tall = menuOf(pages, [](const Page& page) { return page.isTall(); });
    const size_t still = menuOf(pages, [](const Page& page) { return page.pictures.size() == 1 && !page.isTall(); });

    Programs programs = {Program{"bare pager", {BARE_PAGER, pagesFile}, {}, {}, {}},
                         Program{"application", {APPLICATION}, {}, {}, {}}};
    // The first round fills the caches of the disk and of the fonts, and is not counted.
    for (int round = 0; round <= rounds; ++round) {
        for (Program& program : programs) {
            Program ignored = program;
            Program& counted = round > 0 ? program : ignored;
            bench::visit(program.command, pages, 0, true, counted.whole);
            bench::visit(program.command, pages, tall, false, counted.tall);
            bench::visit(program.command, pages, still, false, counted.still);
        }
    }
    print(programs, pages);
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        const int rounds = argc > 1 ? std::atoi(argv[1]) : 7;
        if (rounds < 1) {
            throw std::runtime_error("usage: pages-bench [ROUNDS]");
        }
        return run(rounds);
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "pages-bench: %s\n", failure.what());
        return 1;
    }
}
