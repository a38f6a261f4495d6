#pragma once

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// Which calls of which host operations fail. A plan is made of rules in the form
//
//   NAME[:K][=STATUS]
//
// NAME is the operation as it is declared ("tzdbOpenObject", "TzEdJig::drag"), or "operator new"
// for memory; its K-th call fails (1 when left out, "*" every one), with STATUS or with its usual
// failure.
//
//   tzhost::FaultPlan plan;
//   if (auto const problem = plan.add("tzedGetPoint:2=-5002")) say(*problem);
//   plan.install();
//
// An installed plan also counts the calls, so that an empty one measures what a run calls. One plan
// is installed at a time; it must live as long as it is installed. Not thread-safe.
namespace tzhost {

class FaultPlan {
public:
    FaultPlan() = default;
    FaultPlan(FaultPlan const&) = delete;
    FaultPlan& operator=(FaultPlan const&) = delete;
    ~FaultPlan() { remove(); }

    // Adds a rule. Returns what is wrong with the rule, or nothing.
    [[nodiscard]] std::optional<std::string> add(std::string_view rule);
    // Puts this plan in force, in place of any other.
    void install();
    // Takes this plan out of force; changes nothing when another plan is in force.
    void remove();
    // Forgets rules and counts.
    void clear();

    // Calls met since install or clear, by operation.
    [[nodiscard]] std::map<std::string, long, std::less<>> const& calls() const { return calls_; }
    // Whether a rule has made a call fail since install or clear.
    [[nodiscard]] bool hasStruck() const { return idleRules().size() < rules_.size(); }
    // A rule that has made no call fail since install or clear: its text, and how often its
    // operation was called.
    struct IdleRule {
        std::string rule;
        long calls = 0;
    };
    [[nodiscard]] std::vector<IdleRule> idleRules() const;

private:
    struct Rule {
        std::string text;
        std::string name;
        long call = 1;  // 0: every one
        std::optional<int> status;
        bool struck = false;
    };

    static bool decide(std::string_view operation, int& status);
    bool strike(std::string_view operation, int& status);

    std::vector<Rule> rules_;
    std::map<std::string, long, std::less<>> calls_;
};

}  // namespace tzhost
