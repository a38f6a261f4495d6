#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "host/database/object_imp.h"
#include "host/drawing_file/limits.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/gi/color.h"

namespace tzhost::drawingfile {

// Writes the members of one object one after the other; the counterpart of MemberReader. Every
// member is written, also one that has its default. The braces stand in `open` and `close`.
class MemberWriter {
public:
    // `kept` holds what the file had that this host does not know; null for nothing.
    explicit MemberWriter(std::string& out,
                          UnknownMembers const* kept = nullptr,
                          std::string path = "")
        : out_(out), kept_(kept), path_(std::move(path)) {}

    void open();
    // The members that follow stand on lines of their own.
    void breakLines() { separator_ = ",\n "; }
    // The unknown members come last.
    void close();

    void flag(char const* name, bool value);
    void number(char const* name, double value, Range range = Range::any);
    template <class Int>
    void whole(char const* name, Int value, WholeRange /*range*/) {
        number(name, static_cast<double>(value));
    }
    void text(char const* name, std::wstring const& value);
    void point(char const* name, TzGePoint3d const& value);
    void direction(char const* name, TzGeVector3d const& value);
    void color(char const* name, TzCmColor const& value, WholeRange indices);
    void layer(char const* name, TzDbObjectId value);
    void textStyle(char const* name, TzDbObjectId value);
    void numbers(char const* name, std::vector<double> const& values, Range range);
    void null(char const* name);
    // The start of an object's or an array's member, whose value the caller appends.
    std::string& begin(std::string_view name);
    // An object's member, written by `describe`.
    template <class Describe>
    void nested(char const* name, Describe const& describe) {
        MemberWriter inner(begin(name), kept_, path_.empty() ? name : path_ + '.' + name);
        inner.open();
        describe(inner);
        inner.close();
    }

private:
    void record(char const* name, TzDbObjectId value, wchar_t const* none);

    std::string& out_;
    UnknownMembers const* kept_;
    std::string path_;
    char const* separator_ = ",";
    bool first_ = true;
};

// The name of a table's record in UTF-8.
[[nodiscard]] std::string recordName(TzDbObjectId id);

}  // namespace tzhost::drawingfile
