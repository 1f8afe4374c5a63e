// What loading the catalogue costs beside the least that anybody could do with the same files: parsing them with
// libxml2, and writing as many preferences. Every case runs with 15, 150 and 1500 menus, which shows how cost grows.

#include "BareLoad.h"
#include "Catalogue.h"
#include "KestContentMgr.h"
#include "RatioReport.h"

#include <cstdio>
#include <map>
#include <memory>
#include <stdexcept>

namespace {

using bench::Catalogue;

constexpr int sizes[] = {15, 150, 1500};

std::map<std::int64_t, std::unique_ptr<Catalogue>>& catalogues() {
    static std::map<std::int64_t, std::unique_ptr<Catalogue>> all;
    return all;
}

/// The catalogue of that size, its device made the process's; built at the first call, kept for the next ones.
Catalogue& catalogueOf(benchmark::State& state) {
    std::unique_ptr<Catalogue>& catalogue = catalogues()[state.range(0)];
    if (!catalogue) {
        catalogue = std::make_unique<Catalogue>(static_cast<int>(state.range(0)));
    } else {
        catalogue->device().reopen();
    }
    return *catalogue;
}

/// Loads in full and checks that it was the whole catalogue.
void loadAll(int menus) {
    KestContentMgr* manager = KestContentMgr::getInstance();
    if (!manager->loadContentsList(true) || manager->getContentsList().size() != static_cast<size_t>(menus)) {
        throw std::runtime_error("the catalogue did not load");
    }
}

void FullLoad(benchmark::State& state) {
    catalogueOf(state);
    for ([[maybe_unused]] auto _ : state) {
        loadAll(static_cast<int>(state.range(0)));
    }
}

void CachedLoad(benchmark::State& state) {
    catalogueOf(state);
    loadAll(static_cast<int>(state.range(0)));
    for ([[maybe_unused]] auto _ : state) {
        KestContentMgr::getInstance()->loadContentsList(false);
    }
}

void BareParse(benchmark::State& state) {
    const Catalogue& catalogue = catalogueOf(state);
    for ([[maybe_unused]] auto _ : state) {
        bench::parseBare(catalogue.files());
    }
}

void BareParseAndWrites(benchmark::State& state) {
    Catalogue& catalogue = catalogueOf(state);
    loadAll(static_cast<int>(state.range(0)));
    const auto values = catalogue.device()->preferences().all("com.ravella.kest");
    const support::TemporaryFolder folder;
    bench::BareStore store(folder.path() / "bare.db");
    for ([[maybe_unused]] auto _ : state) {
        bench::parseBare(catalogue.files());
        store.write(values);
    }
}

void registerAll() {
    const std::pair<const char*, void (*)(benchmark::State&)> cases[] = {{"FullLoad", FullLoad},
                                                                         {"CachedLoad", CachedLoad},
                                                                         {"BareParse", BareParse},
                                                                         {"BareParseAndWrites", BareParseAndWrites}};
    for (const auto& [name, function] : cases) {
        for (const int menus : sizes) {
            benchmark::RegisterBenchmark(name, function)
                ->Arg(menus)
                ->Repetitions(7)
                ->ReportAggregatesOnly()
                ->Unit(benchmark::kMicrosecond);
        }
    }
}

std::string at(const char* name, int menus) {
    return std::string(name) + "/" + std::to_string(menus);
}

void printRatios(const bench::RatioReport& report) {
    std::printf("\n%-52s %8s %8s %8s\n", "menus", "15", "150", "1500");
    const auto row = [&](const char* label, auto value) {
        std::printf("%-52s", label);
        for (const int menus : sizes) {
            std::printf(" %8.2f", value(menus));
        }
        std::printf("\n");
    };
    const auto ratio = [&](const char* what, const char* to) {
        return [&report, what, to](int menus) {
            return report.processorTime(at(what, menus)) / report.processorTime(at(to, menus));
        };
    };
    const auto growth = [&](const char* what) {
        return [&report, what](int menus) {
            return report.processorTime(at(what, menus)) / menus /
                   (report.processorTime(at(what, sizes[0])) / sizes[0]);
        };
    };
    row("full load / bare parse and its writes (aim: 2.00)", ratio("FullLoad", "BareParseAndWrites"));
    row("the same, of the time that passes", [&report](int menus) {
        return report.passedTime(at("FullLoad", menus)) / report.passedTime(at("BareParseAndWrites", menus));
    });
    row("full load / bare parse", ratio("FullLoad", "BareParse"));
    row("cached load / bare parse", ratio("CachedLoad", "BareParse"));
    row("cached load / full load", ratio("CachedLoad", "FullLoad"));
    row("full load, cost of a menu / its cost among 15", growth("FullLoad"));
    row("cached load, cost of a menu / its cost among 15", growth("CachedLoad"));
}

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) {
        return 1;
    }
    registerAll();
    bench::RatioReport report;
    const size_t run = benchmark::RunSpecifiedBenchmarks(&report);
    if (run == std::size(sizes) * 4) {
        printRatios(report);
    }
    benchmark::Shutdown();
    catalogues().clear();
    return 0;
}
