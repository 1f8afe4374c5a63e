#pragma once

#include "device/LaunchRequest.h"

#include <string>
#include <vector>

namespace device {

/// The links that lead into an application, and what each asks of it. Their form is a URI template as of RFC 6570, of
/// which it may have SCHEME:{NAME}, and behind that {?NAME,NAME...}. The names are those of the extras.
/// Behind the template a line NAME=PATTERN for each of some names: their values have at most 255 bytes and match it, an
/// ECMAScript regular expression.
class Link {
public:
    /// Throws Error, one line, when the text is no such form.
    explicit Link(const std::string& form);

    const std::string& form() const { return form_; }

    /// The extras of the launch request that the link stands for: its first name always, of the others those that it
    /// gives. All are texts that are not empty.
    /// Throws Error, one line with the link in it, for a link that is not of this form.
    Extras extrasOf(const std::string& uri) const;

private:
    Extras readQuery(const std::string& query) const;

    std::string form_;
    std::string scheme_;  ///< in small letters
    std::string first_;
    std::vector<std::string> others_;
};

}  // namespace device
