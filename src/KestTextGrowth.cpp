#include "KestTextGrowth.h"

#include "KestLog.h"
#include "KestMarkup.h"
#include "KestXmlLimits.h"

std::string KestTextGrowth::withAbsolutePaths(const std::string& text, const std::string& directory,
                                              KestLoadWork& work) {
    const std::string reference = "href=file:";
    // The directory begins with a slash itself; the text engine expects both.
    const std::string absolute = "href=file:/" + directory;
    const std::uint64_t growth = std::uint64_t{KestMarkup::count(text, reference)} * absolute.size();
    if (growth > KestXmlLimits::longestFile || !work.spendOnText(text.size() + growth)) {
        KEST_WARN("too many references to files below %s", directory.c_str());
        return text;
    }
    return KestMarkup::replaceString(text, reference, absolute, false);
}

void KestTextGrowth::attach(KestContentInfo& record, const std::string& placeholder, const std::string& fragment,
                            KestLoadWork& work) {
    const size_t size = record.textContents.size() + fragment.size();
    if (size > KestXmlLimits::longestFile || !work.spendOnText(KestLoadWork::ofSearching(size))) {
        KEST_WARN("too much to attach: %s", record.path.c_str());
        return;
    }
    const size_t found = KestMarkup::find(record.textContents, placeholder, 0);
    if (found != std::string::npos) {
        record.textContents.replace(found, placeholder.size(), fragment);
    }
}
