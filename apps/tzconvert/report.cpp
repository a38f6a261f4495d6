#include "apps/tzconvert/report.h"

#include <cassert>

#include <nlohmann/json.hpp>

namespace tzconvert {
namespace {

nlohmann::ordered_json resultsOf(Results const& results) {
    return {
        {"incidents",       results.incidents      },
        {"tracking",        results.tracking       },
        {"widthFactor",     results.widthFactor    },
        {"oblique",         results.oblique        },
        {"baseAlignment",   results.baseAlignment  },
        {"minFontSize",     results.minFontSize    },
        {"maxFontSize",     results.maxFontSize    },
        {"initialFontSize", results.initialFontSize},
        {"currentFontSize", results.currentFontSize},
        {"stacksSeen",      results.stacksSeen     },
    };
}

}  // namespace

std::string reportText(Options const& options, std::vector<FileReport> const& reports) {
    nlohmann::ordered_json root;
    if (options.outputDir.empty()) {
        assert(reports.size() == 1);
        root = resultsOf(reports.front().results);
    } else {
        root = nlohmann::ordered_json::array();
        for (FileReport const& report : reports) {
            nlohmann::ordered_json entry = {
                {"file", report.file}
            };
            entry.update(resultsOf(report.results));
            root.push_back(entry);
        }
    }
    // A file's name need not be UTF-8.
    return root.dump(2, ' ', false, nlohmann::ordered_json::error_handler_t::replace) + "\n";
}

}  // namespace tzconvert
