#include "apps/tzdraft/commands/choices.h"

#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "host/command_line/symbol_names.h"
#include "host/runtime/command_stack.h"
#include "host/settings/variable_table.h"
#include "host/text/near_words.h"

namespace tzdraft {
namespace {

using Names = std::vector<std::wstring>;

// With no names Tab does nothing, instead of putting a tab into a name.
tzhost::Offer offerFrom(Names (*list)()) {
    tzhost::Offer offer{tzhost::Offer::Kind::names};
    if (tzhost::commandLine().isPerson()) offer.choices = list();
    return offer;
}

tzhost::Drawing& drawing() {
    return ProgramSession::current().drawing();
}

Names variableNames() {
    Names names;
    for (tzhost::VariableDefinition const& each : tzhost::variableTable())
        names.emplace_back(each.name);
    return names;
}

}  // namespace

tzhost::Offer offerLayers() {
    return offerFrom([] { return tzhost::symbolNames(drawing().layerTableId()); });
}

tzhost::Offer offerStyles() {
    return offerFrom([] { return tzhost::symbolNames(drawing().textStyleTableId()); });
}

tzhost::Offer offerBlocks() {
    return offerFrom([] { return tzhost::symbolNames(drawing().blockTableId()); });
}

tzhost::Offer offerVariables() {
    return offerFrom(variableNames);
}

tzhost::Offer offerCommands() {
    return offerFrom(commandNames);
}

std::vector<std::wstring> commandNames() {
    Names names;
    for (tzhost::Command const& each : tzhost::commandStack().commands()) {
        names.push_back(each.localName.str());
        names.push_back(L'_' + each.globalName.str());
    }
    return names;
}

std::wstring nearCommand(std::wstring_view typed) {
    std::wstring const near = tzhost::nearestWord(typed, commandNames());
    if (near.empty()) return near;
    return TzString::formatted(localText(L" Near it is %ls."), near.c_str()).str();
}

}  // namespace tzdraft
