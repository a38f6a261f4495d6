#include "apps/options/option_list.h"

#include <nlohmann/json.hpp>
#include <string_view>

namespace tzapps {
namespace {

using Json = nlohmann::ordered_json;

constexpr std::string_view kAsked = "--option-list";

Json describe(CLI::Option const& option,
              CLI::FormatterBase const& labels,
              ValueWords const& words) {
    Json row;
    if (option.get_positional()) {
        row["argument"] = option.get_single_name();
    } else {
        Json names = Json::array();
        for (std::string const& each : option.get_snames())
            names.push_back("-" + each);
        for (std::string const& each : option.get_lnames())
            names.push_back("--" + each);
        row["names"] = names;
        if (option.get_items_expected_max() != 0) {
            std::string const value = option.get_type_name();
            row["value"] = value;
            if (labels.get_label(value) != value) row["shown"] = labels.get_label(value);
            auto const offered = words.find(option.get_name());
            if (offered != words.end()) row["words"] = offered->second;
        }
    }
    row["help"] = option.get_description();
    return row;
}

Json optionsOf(CLI::App const& app, ValueWords const& words) {
    Json rows = Json::array();
    auto const isShown = [](CLI::Option const* option) { return !option->get_group().empty(); };
    for (CLI::Option const* each : app.get_options(isShown))
        rows.push_back(describe(*each, *app.get_formatter(), words));
    return rows;
}

}  // namespace

std::optional<std::string>
optionList(CLI::App const& app, ValueWords const& words, int count, char const* const* arguments) {
    if (count != 2 || arguments[1] != kAsked) return std::nullopt;
    Json commands = Json::array();
    for (CLI::App const* each : app.get_subcommands({})) {
        commands.push_back({{"name", each->get_name()},
                            {"help", each->get_description()},
                            {"options", optionsOf(*each, words)}});
    }
    Json const all{
        {"program", app.get_name()}, {"options", optionsOf(app, words)}, {"commands", commands}};
    return all.dump(1) + '\n';
}

}  // namespace tzapps
