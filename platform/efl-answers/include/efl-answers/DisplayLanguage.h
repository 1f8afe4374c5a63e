#pragma once

#include <string>

/// Makes the process speak the device's display language, on any workstation: also one that has no locale of that
/// language, or one in another character set than UTF-8.
/// Texts come from gettext catalogues by the language itself; the C library's locale only has to be one with
/// UTF-8 in which it translates at all.
class DisplayLanguage {
public:
    /// Accepts "ko", "ko_KR", "ko_KR.UTF-8", "sr_RS@latin". Whatever codeset is named, UTF-8 is meant. "", "C"
    /// and "POSIX", and what is no language at all, mean: no translation.
    explicit DisplayLanguage(const std::string& name);

    /// Makes it the language of this process's texts, from the next text on. Never fails.
    void use() const;

    /// Without its codeset, as gettext names catalogues: "ko_KR", "sr_RS@latin"; "" for no translation.
    const std::string& name() const { return name_; }
    /// The locale that the C library can set for it: "ko_KR.UTF-8" where that exists, else "C.UTF-8".
    std::string locale() const;
    /// Whether it is read from right to left, by the script that it is written in.
    bool isRightToLeft() const;

    /// Binds a text domain to a folder of catalogues; its texts come as UTF-8.
    static void bindTexts(const std::string& domain, const std::string& folder);

private:
    std::string name_;
};
