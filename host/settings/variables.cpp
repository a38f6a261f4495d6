#include "host/settings/variables.h"

#include "host/text/local_text.h"
#include "tz/rx/status.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

WriteResult refused(std::wstring reason) {
    return {Tzad::ePromptError, std::move(reason)};
}

WriteResult done() {
    return {Tzad::ePromptNormal, {}};
}

WriteResult unknown(std::wstring_view name) {
    return refused(TzString::formatted(localText(L"There is no system variable \"%ls\"."),
                                       std::wstring(name).c_str())
                       .str());
}

std::wstring sentence(VariableDefinition const& row, std::wstring_view rest) {
    return std::wstring(row.name) + L' ' + std::wstring(rest) + L'.';
}

bool isRefused(VariableDefinition const& row, Writer writer) {
    return row.access == Access::readOnly && writer != Writer::host;
}

WriteResult checked(VariableDefinition const& row, VariableValue const& value) {
    if (auto const complaint = row.complaintAbout(value)) return refused(sentence(row, *complaint));
    return done();
}

}  // namespace

Variables& Variables::instance() {
    static Variables store;
    return store;
}

Variables::Variables() {
    for (VariableDefinition const& row : variableTable()) {
        slots_.push_back({row.defaultValue(), std::nullopt});
    }
}

Variables::Slot& Variables::slotOf(VariableDefinition const& row) {
    return slots_[static_cast<std::size_t>(&row - variableTable().data())];
}

Variables::Slot const& Variables::slotOf(VariableDefinition const& row) const {
    return slots_[static_cast<std::size_t>(&row - variableTable().data())];
}

VariableValue const* Variables::get(std::wstring_view name) const {
    VariableDefinition const* const row = findVariable(name);
    return row == nullptr ? nullptr : &get(*row);
}

VariableValue const& Variables::get(VariableDefinition const& row) const {
    Slot const& slot = slotOf(row);
    return slot.override_ ? *slot.override_ : slot.value;
}

double Variables::number(std::wstring_view name) const {
    VariableValue const* const value = get(name);
    if (value == nullptr) return 0;
    if (short const* const whole = std::get_if<short>(value)) return *whole;
    double const* const real = std::get_if<double>(value);
    return real != nullptr ? *real : 0;
}

std::wstring Variables::text(std::wstring_view name) const {
    VariableValue const* const value = get(name);
    std::wstring const* const held = value ? std::get_if<std::wstring>(value) : nullptr;
    return held != nullptr ? *held : std::wstring();
}

WriteResult Variables::set(std::wstring_view name, VariableValue const& value, Writer writer) {
    VariableDefinition const* const row = findVariable(name);
    if (row == nullptr) return unknown(name);
    if (isRefused(*row, writer)) return refused(sentence(*row, localText(L"is read-only")));
    WriteResult result = checked(*row, value);
    if (!result.isDone()) return result;
    Slot& slot = slotOf(*row);
    slot.value = value;
    if (row->access == Access::readWrite) slot.override_.reset();
    // A copy, since an observer may take itself or another out.
    auto const observers = observers_;
    for (auto const& [number, observer] : observers)
        observer({*row, value, writer});
    return result;
}

WriteResult Variables::setFromText(std::wstring_view name, std::wstring_view text, Writer writer) {
    VariableDefinition const* const row = findVariable(name);
    if (row == nullptr) return unknown(name);
    if (isRefused(*row, writer)) return refused(sentence(*row, localText(L"is read-only")));
    auto const value = readValue(row->type, text);
    if (!value) return refused(sentence(*row, localText(L"takes ") + row->takes()));
    return set(name, *value, writer);
}

WriteResult Variables::overrideFromText(std::wstring_view name, std::wstring_view text) {
    VariableDefinition const* const row = findVariable(name);
    if (row == nullptr) return unknown(name);
    auto const value = readValue(row->type, text);
    if (!value) return refused(sentence(*row, localText(L"takes ") + row->takes()));
    WriteResult result = checked(*row, *value);
    if (result.isDone()) slotOf(*row).override_ = *value;
    return result;
}

Variables::Values Variables::kept(KeptIn kind) const {
    Values values;
    for (VariableDefinition const& row : variableTable()) {
        if (row.kept == kind) values.emplace_back(row.name, slotOf(row).value);
    }
    return values;
}

void Variables::resetKept(KeptIn kind) {
    for (VariableDefinition const& row : variableTable()) {
        if (row.kept == kind) slotOf(row).value = row.defaultValue();
    }
}

void Variables::reset() {
    for (VariableDefinition const& row : variableTable())
        slotOf(row) = {row.defaultValue(), std::nullopt};
}

WriteResult Variables::setKept(std::wstring_view name, VariableValue const& value) {
    VariableDefinition const* const row = findVariable(name);
    if (row == nullptr) return unknown(name);
    WriteResult result = checked(*row, value);
    if (result.isDone()) slotOf(*row).value = value;
    return result;
}

Variables::Snapshot Variables::snapshot() const {
    Snapshot taken;
    for (VariableDefinition const& row : variableTable()) {
        if (row.kept == KeptIn::drawing) taken.push_back(slotOf(row));
    }
    return taken;
}

void Variables::restore(Snapshot const& snapshot) {
    auto from = snapshot.begin();
    for (VariableDefinition const& row : variableTable()) {
        if (row.kept == KeptIn::drawing && from != snapshot.end()) slotOf(row) = *from++;
    }
}

int Variables::addObserver(Observer observer) {
    observers_.emplace(nextObserver_, std::move(observer));
    return nextObserver_++;
}

void Variables::removeObserver(int number) {
    observers_.erase(number);
}

}  // namespace tzhost
