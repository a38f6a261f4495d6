#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "host/page/page.h"

// The members of a page as texts, for options, questions and files. Letters count without case, and
// numbers follow no locale; nothing comes back for what is no such member.
namespace tzhost {

// A3, letter, or WxH in millimetres, each side from 1 to 5000.
[[nodiscard]] std::optional<Paper> readPaper(std::string_view text);
[[nodiscard]] std::string nameOf(Paper const& paper);
// The names that papers have.
[[nodiscard]] std::vector<std::string> paperNames();

// N:M, both above 0 and their quotient a number.
[[nodiscard]] std::optional<PageScale> readScale(std::string_view text);
[[nodiscard]] std::optional<PageScale> makeScale(double paper, double drawing);
[[nodiscard]] std::string nameOf(PageScale const& scale);
// The same, or "fit", which gives no scale.
[[nodiscard]] std::optional<std::optional<PageScale>> readScaleOrFit(std::string_view text);

// mm, cm, m, in or ft.
[[nodiscard]] std::optional<PageUnit> readUnit(std::string_view text);
[[nodiscard]] char const* nameOf(PageUnit unit);
[[nodiscard]] double millimetresOf(PageUnit unit);

// X1,Y1,X2,Y2: any two opposite corners of a window that has a size.
[[nodiscard]] std::optional<PageBox> readWindow(std::string_view text);
[[nodiscard]] std::optional<PageBox> makeWindow(double x1, double y1, double x2, double y2);
[[nodiscard]] std::string nameOf(PageBox const& window);
// The same, or "all", which gives no window.
[[nodiscard]] std::optional<std::optional<PageBox>> readWindowOrAll(std::string_view text);

// The whole text as a finite number, and the shortest text of one.
[[nodiscard]] std::optional<double> readPlainNumber(std::string_view text);
[[nodiscard]] std::string plainText(double value);

// What each member takes, for messages: "A0 to A4, ...".
extern char const* const kPapers;
extern char const* const kScales;
extern char const* const kUnits;
extern char const* const kWindows;

}  // namespace tzhost
