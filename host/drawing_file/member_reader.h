#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "host/drawing_file/limits.h"
#include "host/drawing_file/read_context.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/gi/color.h"

namespace tzhost::drawingfile {

// Reads the members of one object into values. It has the operations of MemberWriter, so that one
// description of a class (members.h) both reads and writes it. A member that is left out leaves its
// value alone; a wrong one is complained about.
class MemberReader {
public:
    // `path` names the object in messages and among unknown members: "" or "columns". What nobody
    // asks for is added to `unknown` by `keepRest`.
    MemberReader(ReadContext& context,
                 JsonValue const& object,
                 UnknownMembers& unknown,
                 std::string path = "");

    void flag(char const* name, bool& value);
    void number(char const* name, double& value, Range range);
    template <class Int>
    void whole(char const* name, Int& value, WholeRange range) {
        int read = static_cast<int>(value);
        wholeNumber(name, read, range);
        value = static_cast<Int>(read);
    }
    void text(char const* name, std::wstring& value);
    void point(char const* name, TzGePoint3d& value);
    // A direction, at length 1 afterwards.
    void direction(char const* name, TzGeVector3d& value);
    // Colour indices from `lowest` on, to `highest`, or a text "#RRGGBB".
    void color(char const* name, TzCmColor& value, WholeRange indices);
    // Records of tables by name.
    void layer(char const* name, TzDbObjectId& value);
    void textStyle(char const* name, TzDbObjectId& value);
    // A list of numbers; left out when there is none.
    void numbers(char const* name, std::vector<double>& values, Range range);

    // The member itself, which counts as known; null when it is left out.
    [[nodiscard]] JsonValue const* take(char const* name);
    // An object or an array; null, also after a complaint, when there is none.
    [[nodiscard]] JsonValue const* takeOf(char const* name, JsonKind kind);
    // Reads the members of an object's member, if it is there, by `describe`.
    template <class Describe>
    void nested(char const* name, Describe const& describe) {
        JsonValue const* const member = takeOf(name, JsonKind::object);
        if (!member) return;
        MemberReader inner(context_, *member, unknown_, pathOf(name));
        describe(inner);
        inner.keepRest();
    }
    // Adds what nobody asked for to the unknown members.
    void keepRest();

    [[nodiscard]] ReadContext& context() { return context_; }
    [[nodiscard]] std::string pathOf(std::string_view name) const;
    [[nodiscard]] int line() const { return object_.line; }
    void complain(char const* name, std::string what) const;

private:
    void wholeNumber(char const* name, int& value, WholeRange range);
    void record(char const* name, TzDbObjectId& value, TzDbObjectId table, char const* kind);
    // Says that a member has a wrong value.
    void refuse(char const* name, JsonValue const& member, std::string_view expected) const;
    // Three finite numbers.
    [[nodiscard]] bool triple(char const* name, double (&values)[3]);

    ReadContext& context_;
    JsonValue const& object_;
    UnknownMembers& unknown_;
    std::string path_;
    std::vector<bool> known_;  // by the index of the member
    // Where the next search begins: members mostly come in the order in which they are asked for.
    std::size_t next_ = 0;
};

}  // namespace tzhost::drawingfile
