#include "apps/tzconvert/report.h"

#include <cassert>

#include <nlohmann/json.hpp>

namespace tzconvert {
namespace {

nlohmann::ordered_json resultsOf(MarkupFindings const& found) {
    return {
        {"incidents", found.incidents},
        {"tracking", found.wholeText.tracking},
        {"widthFactor", found.wholeText.charWidth},
        {"oblique", found.wholeText.oblique},
        {"baseAlignment", found.wholeText.baseAlignment},
        {"minFontSize", found.minFontSize},
        {"maxFontSize", found.maxFontSize},
        {"initialFontSize", found.initialFontSize},
        {"currentFontSize", found.currentFontSize},
        {"stacksSeen", found.stacksSeen},
    };
}

}  // namespace

std::string reportText(Options const& options, std::vector<FileReport> const& reports) {
    nlohmann::ordered_json root;
    if (options.outputDir.empty()) {
        assert(reports.size() == 1);
        root = resultsOf(reports.front().found);
    } else {
        root = nlohmann::ordered_json::array();
        for (FileReport const& report : reports) {
            nlohmann::ordered_json entry = {{"file", report.file}};
            entry.update(resultsOf(report.found));
            root.push_back(entry);
        }
    }
    // A file's name need not be UTF-8.
    return root.dump(2, ' ', false, nlohmann::ordered_json::error_handler_t::replace) + "\n";
}

}  // namespace tzconvert
