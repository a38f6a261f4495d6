#include "host/drawing_file/member_writer.h"

#include "host/database/symbol_imp.h"
#include "host/database/true_color.h"
#include "host/files/json_value.h"
#include "host/text/utf8.h"

namespace tzhost::drawingfile {
namespace {

void writeTriple(std::string& out, double x, double y, double z) {
    out += '[';
    writeNumber(out, x);
    out += ',';
    writeNumber(out, y);
    out += ',';
    writeNumber(out, z);
    out += ']';
}

}  // namespace

void MemberWriter::open() {
    out_ += '{';
    first_ = true;
}

void MemberWriter::close() {
    if (kept_) {
        for (UnknownMember const& member : *kept_) {
            if (member.path == path_) begin(member.name) += member.json;
        }
    }
    out_ += '}';
}

std::string& MemberWriter::begin(std::string_view name) {
    if (!first_) out_ += separator_;
    first_ = false;
    writeText(out_, name);
    out_ += ':';
    return out_;
}

void MemberWriter::flag(char const* name, bool value) {
    begin(name) += value ? "true" : "false";
}

void MemberWriter::number(char const* name, double value, Range /*range*/) {
    writeNumber(begin(name), value);
}

void MemberWriter::text(char const* name, std::wstring const& value) {
    writeText(begin(name), toUtf8(value));
}

void MemberWriter::point(char const* name, TzGePoint3d const& value) {
    writeTriple(begin(name), value.x, value.y, value.z);
}

void MemberWriter::direction(char const* name, TzGeVector3d const& value) {
    writeTriple(begin(name), value.x, value.y, value.z);
}

void MemberWriter::color(char const* name, TzCmColor const& value, WholeRange /*indices*/) {
    if (!value.isByColor()) return number(name, value.colorIndex());
    writeText(begin(name), trueColorText(value));
}

void MemberWriter::record(char const* name, TzDbObjectId value, wchar_t const* none) {
    writeText(begin(name), value.isNull() ? toUtf8(none) : recordName(value));
}

void MemberWriter::layer(char const* name, TzDbObjectId value) {
    record(name, value, L"0");
}

void MemberWriter::textStyle(char const* name, TzDbObjectId value) {
    record(name, value, L"Standard");
}

void MemberWriter::numbers(char const* name, std::vector<double> const& values, Range /*range*/) {
    std::string& out = begin(name);
    out += '[';
    for (std::size_t i = 0; i < values.size(); ++i) {
        if (i > 0) out += ',';
        writeNumber(out, values[i]);
    }
    out += ']';
}

void MemberWriter::null(char const* name) {
    begin(name) += "null";
}

std::string recordName(TzDbObjectId id) {
    return toUtf8(valuesOf<SymbolImp>(*id.record()->object).name);
}

}  // namespace tzhost::drawingfile
