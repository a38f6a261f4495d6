#include "host/drawing_file/page_member.h"

#include <array>
#include <cmath>

#include "host/drawing_file/member_reader.h"
#include "host/page/page_plan.h"
#include "host/page/page_text.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost::drawingfile {
namespace {

constexpr char const* kScaleForm = forLocalText("null or two numbers above 0");
constexpr char const* kWindowForm = forLocalText("null or two opposite corners, [[x,y],[x,y]]");

void refuse(MemberReader const& members, char const* name, char const* expected) {
    members.complain(name, localText("is not what it takes, expected ") + localText(expected));
}

// A text that `read` makes a value of.
template <class Value, class Read>
void word(MemberReader& members, char const* name, Value& value, Read read, char const* expected) {
    JsonValue const* const member = members.takeOf(name, JsonKind::text);
    if (!member) return;
    auto const found = read(member->text);
    if (!found) return refuse(members, name, expected);
    value = *found;
}

// Two numbers; nothing for anything else.
std::optional<std::array<double, 2>> pairOf(JsonValue const& value) {
    if (value.kind != JsonKind::array || value.items.size() != 2) return std::nullopt;
    std::array<double, 2> numbers{};
    for (std::size_t i = 0; i < numbers.size(); ++i) {
        JsonValue const& item = value.items[i];
        if (item.kind != JsonKind::number || !std::isfinite(item.number)) return std::nullopt;
        numbers[i] = item.number;
    }
    return numbers;
}

void readScaleMember(MemberReader& members, Page& page) {
    JsonValue const* const member = members.take("scale");
    if (!member || member->kind == JsonKind::null) return;
    auto const parts = pairOf(*member);
    if (parts) page.scale = makeScale((*parts)[0], (*parts)[1]);
    if (!page.scale) refuse(members, "scale", kScaleForm);
}

void readWindowMember(MemberReader& members, Page& page) {
    JsonValue const* const member = members.take("window");
    if (!member || member->kind == JsonKind::null) return;
    bool const isPair = member->kind == JsonKind::array && member->items.size() == 2;
    auto const from = isPair ? pairOf(member->items[0]) : std::nullopt;
    auto const to = isPair ? pairOf(member->items[1]) : std::nullopt;
    if (from && to) page.window = makeWindow((*from)[0], (*from)[1], (*to)[0], (*to)[1]);
    if (!page.window) refuse(members, "window", kWindowForm);
}

std::wstring wide(std::string const& text) {
    return fromUtf8(text);
}

void writePoint(std::string& out, char const* before, double x, double y) {
    out += before;
    out += '[';
    writeNumber(out, x);
    out += ',';
    writeNumber(out, y);
    out += ']';
}

}  // namespace

void readPage(ReadContext& context, JsonValue const& value, std::optional<Page>& page) {
    page.reset();
    if (value.kind == JsonKind::null) return;
    if (value.kind != JsonKind::object) {
        return context.complain(value.line, "page",
                                localText("is ") + nameOf(value.kind) + localText(", expected ") +
                                    nameOf(JsonKind::object));
    }
    MemberReader members(context, value, context.drawing.unknown, "page");
    Page read;
    word(members, "paper", read.paper, readPaper, kPapers);
    members.flag("landscape", read.landscape);
    members.number("margin", read.margin, Range::size);
    readScaleMember(members, read);
    word(members, "unit", read.unit, readUnit, kUnits);
    readWindowMember(members, read);
    members.keepRest();
    if (auto const problem = problemOf(read))
        members.complain(hasRoom(read) ? "scale" : "margin", *problem);
    page = read;
}

void writePage(MemberWriter& members, Page const& page) {
    members.nested("page", [&](MemberWriter& inner) {
        inner.text("paper", wide(nameOf(page.paper)));
        inner.flag("landscape", page.landscape);
        inner.number("margin", page.margin);
        if (page.scale)
            inner.numbers("scale", {page.scale->paper, page.scale->drawing}, Range::any);
        else
            inner.null("scale");
        inner.text("unit", wide(nameOf(page.unit)));
        if (!page.window) return inner.null("window");
        auto const& [left, bottom, right, top] = *page.window;
        std::string& out = inner.begin("window");
        writePoint(out, "[", left, bottom);
        writePoint(out, ",", right, top);
        out += ']';
    });
}

}  // namespace tzhost::drawingfile
