#pragma once

#include "device/LaunchRequest.h"

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace device {

/// The links that lead into an application, and what each asks of it. Their form is a URI template as of RFC 6570, of
/// which it may have SCHEME:{NAME}, and behind that {?NAME,NAME...}. The names are those of the extras.
class Link {
public:
    /// Throws Error, one line, when the text is no such form.
    explicit Link(const std::string& form);

    const std::string& form() const { return form_; }

    /// From now on the values of that name have at most 255 bytes and match the pattern, an ECMAScript regular
    /// expression.
    /// Throws Error, one line, for a name that the form does not have or that has a pattern already, and for a text
    /// that is no regular expression or has more than 1000 characters.
    void restrict(const std::string& name, const std::string& pattern);

    /// Whether the text begins as these links do, in capitals or not.
    bool isSchemeOf(const std::string& text) const;

    /// The extras of the launch request that the link stands for: its first name always, of the others those that it
    /// gives. All are texts that are not empty.
    /// Throws Error, one line with the link in it, for a link that is not of this form.
    Extras extrasOf(const std::string& uri) const;

private:
    struct Pattern;
    Extras readQuery(const std::string& query) const;
    void requireMatches(const Extras& extras) const;

    std::string form_;
    std::string scheme_;  ///< in small letters
    std::string first_;
    std::vector<std::string> others_;
    std::map<std::string, std::shared_ptr<const Pattern>> patterns_;
};

}  // namespace device
