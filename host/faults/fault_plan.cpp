#include "host/faults/fault_plan.h"

#include <charconv>

#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

FaultPlan* installed = nullptr;

// The whole text as a number, or nothing.
template <class Number>
std::optional<Number> readWhole(std::string_view text) {
    Number number{};
    auto const [end, problem] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (problem != std::errc() || end != text.data() + text.size()) return std::nullopt;
    return number;
}

std::string wrong(std::string_view rule, char const* what) {
    return "\"" + std::string(rule) + "\": " + localText(what) +
           localText("; expected NAME[:K][=STATUS]");
}

}  // namespace

std::optional<std::string> FaultPlan::add(std::string_view rule) {
    Rule added;
    added.text = rule;
    std::string_view left = rule;
    if (auto const equals = left.rfind('='); equals != std::string_view::npos) {
        added.status = readWhole<int>(left.substr(equals + 1));
        if (!added.status) return wrong(rule, forLocalText("the status is no integer"));
        left = left.substr(0, equals);
    }
    // The number follows a single colon; a double colon is part of a name.
    auto const colon = left.rfind(':');
    if (colon != std::string_view::npos && (colon == 0 || left[colon - 1] != ':')) {
        std::string_view const call = left.substr(colon + 1);
        std::optional<long> const number =
            call == "*" ? std::optional<long>(0) : readWhole<long>(call);
        if (!number || (call != "*" && *number < 1))
            return wrong(rule, forLocalText("the call is neither 1 or more nor *"));
        added.call = *number;
        left = left.substr(0, colon);
    }
    if (left.empty()) return wrong(rule, forLocalText("the operation has no name"));
    added.name = left;
    rules_.push_back(std::move(added));
    return std::nullopt;
}

void FaultPlan::install() {
    installed = this;
    calls_.clear();
    for (Rule& rule : rules_)
        rule.struck = false;
    (void)setFaultHook(&FaultPlan::decide);
}

void FaultPlan::remove() {
    if (installed != this) return;
    installed = nullptr;
    (void)setFaultHook(nullptr);
}

void FaultPlan::clear() {
    rules_.clear();
    calls_.clear();
}

std::vector<FaultPlan::IdleRule> FaultPlan::idleRules() const {
    std::vector<IdleRule> idle;
    for (Rule const& rule : rules_) {
        if (rule.struck) continue;
        auto const calls = calls_.find(rule.name);
        idle.push_back({rule.text, calls == calls_.end() ? 0 : calls->second});
    }
    return idle;
}

bool FaultPlan::decide(std::string_view operation, int& status) {
    // Memory that the plan itself takes is not counted and never made to fail.
    MemoryFaultPause const pause;
    return installed && installed->strike(operation, status);
}

bool FaultPlan::strike(std::string_view operation, int& status) {
    auto const at = calls_.try_emplace(std::string(operation), 0).first;
    long const call = ++at->second;
    for (Rule& rule : rules_) {
        if (rule.name != operation || (rule.call != 0 && rule.call != call)) continue;
        if (rule.status) status = *rule.status;
        rule.struck = true;
        return true;
    }
    return false;
}

}  // namespace tzhost
