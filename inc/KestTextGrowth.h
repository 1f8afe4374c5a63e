#pragma once

#include "KestContentInfo.h"
#include "KestLoadWork.h"

#include <string>

/// What makes a tip's text longer than the catalogue has it, as far as any tip needs: no text becomes longer than the
/// longest file. Static; holds no state.
class KestTextGrowth {
public:
    /// With the paths of files, which are relative to `directory`, made absolute; as it stands, with a warning, where
    /// that would be too much.
    static std::string withAbsolutePaths(const std::string& text, const std::string& directory, KestLoadWork& work);
    /// Puts `fragment` in the place of the first `placeholder` in the record's contents, unless that would be too much.
    static void attach(KestContentInfo& record, const std::string& placeholder, const std::string& fragment,
                       KestLoadWork& work);
};
