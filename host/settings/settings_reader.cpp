// Checks a settings file member by member. Each member has a row in the table at the end, with the
// function that reads its value.

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

#include "host/files/ini_data.h"
#include "host/files/json_events.h"
#include "host/settings/settings.h"
#include "host/settings/variable_table.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

using Kind = JsonKind;

// Keeps the first fault; nothing is read after it.
class Reader {
public:
    void read(JsonValue const& root);
    [[nodiscard]] SettingsResult take() { return std::move(result_); }

    void variables(JsonValue const& value, std::string const& path);
    void product(JsonValue const& value, std::string const& path);
    void registry(JsonValue const& value, std::string const& path);
    void fabric(JsonValue const& value, std::string const& path);
    template <std::wstring Settings::*Member>
    void text(JsonValue const& value, std::string const& path) {
        if (isA(value, Kind::text, path)) result_.settings.*Member = fromUtf8(value.text);
    }
    template <std::vector<std::wstring> Settings::*Member>
    void texts(JsonValue const& value, std::string const& path) {
        if (!isA(value, Kind::array, path)) return;
        for (JsonValue const& item : value.items) {
            if (!isA(item, Kind::text, path)) return;
            (result_.settings.*Member).push_back(fromUtf8(item.text));
        }
    }

private:
    [[nodiscard]] bool isGood() const { return result_.error.empty(); }
    void fail(JsonValue const& where, std::string const& path, std::string const& what) {
        if (!isGood()) return;
        result_.error =
            std::to_string(where.line) + ": " + (path.empty() ? "" : path + ": ") + what;
    }
    bool isA(JsonValue const& value, Kind kind, std::string const& path) {
        if (value.kind == kind) return true;
        fail(value, path, localText("expected ") + nameOf(kind));
        return false;
    }
    // A whole number of 32 bits without sign.
    std::optional<std::uint32_t> wholeNumber(JsonValue const& value, std::string const& path) {
        constexpr double kMost = std::numeric_limits<std::uint32_t>::max();
        double const number = value.number;
        if (value.kind == Kind::number && number >= 0 && number <= kMost &&
            number == std::trunc(number)) {
            return static_cast<std::uint32_t>(number);
        }
        fail(value, path, localText("expected a whole number from 0 to 4294967295"));
        return std::nullopt;
    }
    void registryValue(std::wstring const& key, JsonMember const& member, std::string const& path);

    SettingsResult result_;
};

struct MemberRow {
    std::string_view name;
    void (Reader::*read)(JsonValue const& value, std::string const& path);
};

constexpr MemberRow kMembers[] = {
    {"variables", &Reader::variables},
    {"product", &Reader::product},
    {"registry", &Reader::registry},
    {"productKey", &Reader::text<&Settings::productKey>},
    {"denied", &Reader::texts<&Settings::denied>},
    {"fabric", &Reader::fabric},
    {"inPlaceEditors", &Reader::texts<&Settings::inPlaceEditors>},
    {"rtfEditor", &Reader::text<&Settings::rtfEditor>},
    {"textEditor", &Reader::text<&Settings::textEditor>},
};

constexpr std::array<std::wstring_view, 2> kRoots{L"hkey_current_user", L"hkey_local_machine"};

bool beginsWithRoot(std::wstring_view key) {
    for (std::wstring_view const root : kRoots) {
        if (key == root || key.substr(0, root.size() + 1) == std::wstring(root) + L'\\')
            return true;
    }
    return false;
}

// The value of a variable of that type. A JSON value of another kind gives a value of another type,
// which the variable refuses.
VariableValue variableValue(JsonValue const& value, VariableType type) {
    if (value.kind == Kind::text) return fromUtf8(value.text);
    double const number = value.kind == Kind::number ? value.number : std::nan("");
    bool const isShort = number == std::trunc(number) && std::fabs(number) <= 32767;
    if (type == VariableType::shortInteger && isShort) return static_cast<short>(number);
    return number;
}

void Reader::read(JsonValue const& root) {
    if (!isA(root, Kind::object, "")) return;
    for (auto const& [key, value] : root.members) {
        std::string const name(key);
        MemberRow const* found = nullptr;
        for (MemberRow const& row : kMembers) {
            if (row.name == name) found = &row;
        }
        if (found == nullptr) return fail(value, name, localText("there is no such setting"));
        (this->*found->read)(value, name);
        if (!isGood()) return;
    }
}

void Reader::variables(JsonValue const& value, std::string const& path) {
    if (!isA(value, Kind::object, path)) return;
    for (auto const& [name, held] : value.members) {
        std::string const here = path + '.' + std::string(name);
        VariableDefinition const* const row = findVariable(fromUtf8(name));
        if (row == nullptr) return fail(held, here, localText("there is no such system variable"));
        if (row->kept != KeptIn::user)
            return fail(held, here, localText("is not kept in the settings"));
        VariableValue const read = variableValue(held, row->type);
        if (auto const complaint = row->complaintAbout(read)) {
            return fail(held, here, toUtf8(*complaint));
        }
        auto const isSame = [&](auto const& each) { return each.first == row->name; };
        if (std::ranges::any_of(result_.settings.variables, isSame))
            return fail(held, here, localText("stands twice, expected each member once"));
        result_.settings.variables.emplace_back(row->name, read);
    }
}

void Reader::product(JsonValue const& value, std::string const& path) {
    if (!isA(value, Kind::object, path)) return;
    for (auto const& [name, values] : value.members) {
        std::string const here = path + '.' + std::string(name);
        if (!isA(values, Kind::object, here)) return;
        auto& into = result_.settings.product[lowered(fromUtf8(name))];
        for (auto const& [key, number] : values.members) {
            auto const read = wholeNumber(number, here + '.' + std::string(key));
            if (!read) return;
            into[lowered(fromUtf8(key))] = *read;
        }
    }
}

void Reader::registry(JsonValue const& value, std::string const& path) {
    if (!isA(value, Kind::object, path)) return;
    for (auto const& [name, values] : value.members) {
        std::string const here = path + '.' + std::string(name);
        std::wstring key = lowered(fromUtf8(name));
        if (!beginsWithRoot(key)) {
            return fail(values, here,
                        localText("expected HKEY_CURRENT_USER or HKEY_LOCAL_MACHINE first"));
        }
        while (key.back() == L'\\')
            key.pop_back();
        if (!isA(values, Kind::object, here)) return;
        result_.settings.registry[key];
        for (JsonMember const& member : values.members) {
            registryValue(key, member, here + '.' + std::string(member.first));
        }
    }
}

void Reader::registryValue(std::wstring const& key,
                           JsonMember const& member,
                           std::string const& path) {
    auto& into = result_.settings.registry[key];
    std::wstring const name = fromUtf8(member.first);
    if (member.second.kind == Kind::text) {
        into.emplace_back(name, fromUtf8(member.second.text));
    } else if (auto const number = wholeNumber(member.second, path)) {
        into.emplace_back(name, *number);
    }
}

void Reader::fabric(JsonValue const& value, std::string const& path) {
    if (isA(value, Kind::flag, path)) result_.settings.fabric = value.flag;
}

}  // namespace

SettingsResult readSettings(std::string_view bytes) {
    if (std::size_t const bad = firstBadByte(bytes); bad != kAllUtf8) {
        auto const line = 1 + std::count(bytes.begin(), bytes.begin() + bad, '\n');
        return {{},
                std::to_string(line) + ": " + localText("the byte at offset ") +
                    std::to_string(bad) + localText(" is no UTF-8")};
    }
    JsonDocument const document = readJson(bytes);
    if (document.failed) {
        auto const& [line, member, what] = document.problem;
        return {{}, std::to_string(line) + ": " + (member.empty() ? "" : member + ": ") + what};
    }
    Reader reader;
    reader.read(document.root);
    return reader.take();
}

}  // namespace tzhost
