#include "HelpFormatter.h"

namespace tool {

namespace {

std::vector<const CLI::Option*> positionalsOf(const CLI::App* app) {
    return app->get_options([](const CLI::Option* option) { return option->get_positional(); });
}

}  // namespace

std::string HelpFormatter::make_help(const CLI::App* app, std::string name, CLI::AppFormatMode mode) const {
    return make_usage(app, std::move(name)) + "\n" + app->get_description() + "\n" + make_positionals(app) +
           make_groups(app, mode) + make_subcommands(app, mode) +
           (app->get_footer().empty() ? "" : "\n" + app->get_footer() + "\n");
}

std::string HelpFormatter::make_usage(const CLI::App* app, std::string name) const {
    std::string usage = "Usage: " + name + " [OPTIONS]";
    for (const CLI::Option* option : positionalsOf(app)) {
        usage += option->get_required() ? " " + option->get_type_name() : " [" + option->get_type_name() + "]";
    }
    if (app->get_subcommands({}).empty()) {
        return usage + "\n";
    }
    return usage + (app->get_require_subcommand_min() > 0 ? " COMMAND\n" : " [COMMAND]\n");
}

std::string HelpFormatter::make_positionals(const CLI::App* app) const {
    const auto options = positionalsOf(app);
    return options.empty() ? "" : make_group("Words", true, options);
}

std::string HelpFormatter::make_option_name(const CLI::Option* option, bool isPositional) const {
    return isPositional ? option->get_type_name() : CLI::Formatter::make_option_name(option, false);
}

std::string HelpFormatter::make_option_opts(const CLI::Option* option) const {
    if (option->get_positional() || option->get_type_size() == 0) {
        return "";
    }
    const std::string otherwise = option->get_default_str();
    return " " + option->get_type_name() + (otherwise.empty() ? "" : " (" + otherwise + ")");
}

}  // namespace tool
