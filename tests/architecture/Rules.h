#pragma once

#include "SourceTree.h"

#include <string>
#include <vector>

/**
 * The rules of docs/architecture.md that a machine can check. Each takes the whole project and returns one line for
 * every place that breaks it, "file:line: what is wrong"; none where the project keeps the rule.
 */
namespace architecture {

using Violations = std::vector<std::string>;

/** The application includes what a device has only: its services, EFL, libxml2, libintl and the standard library. */
Violations applicationIncludesItsAllowedHeaders(const SourceTree& tree);

/** The application has no conditional compilation beside include guards and defaults of what the build may set. */
Violations applicationHasNoConditionalCode(const SourceTree& tree);

/** The application and what builds it have no word about where it runs beside a device, and none about tests. */
Violations applicationKnowsOfNoWorkstation(const SourceTree& tree);

/** The device's fixed paths stand in inc/KestPaths.h only. */
Violations fixedPathsStandInOneHeader(const SourceTree& tree);

/** The platform has no word of the application's and knows of no tip; KEST_DEVICE is the one exception. */
Violations platformKnowsNoApplication(const SourceTree& tree);

/** A layer of the platform includes layers beneath it only, and widgets only where it may. */
Violations layersPointDown(const SourceTree& tree);

/** No source or header has more than 320 lines. */
Violations filesHaveOneJob(const SourceTree& tree);

}  // namespace architecture
