#pragma once

// Reads the pieces of which lengths and angles are made from one text: numbers, marks and blanks.
//
//   UnitReader reader(L" 15 1/2\"");
//   double inches = 0;
//   if (reader.readMixed(inches)) reader.skip('"');
//   if (reader.isAtEnd()) use(inches);
//
// Characters outside ASCII stop every piece. A piece that is not there leaves the place where it
// was. Numbers follow no locale and are always finite.

#include <string>
#include <string_view>

namespace tzhost {

class UnitReader {
public:
    // Blanks at both ends are dropped.
    explicit UnitReader(std::wstring_view text);
    UnitReader(UnitReader const&) = delete;
    UnitReader& operator=(UnitReader const&) = delete;

    [[nodiscard]] bool isAtEnd() const { return at_ == end_; }
    // The character here, 0 at the end; letters as capitals.
    [[nodiscard]] char peek() const;
    // Steps over a character when it stands here; letters count without case.
    bool skip(char c);
    void skipBlanks();
    // A sign here: -1 for a minus, 1 otherwise.
    double readSign();
    // Digits with a fraction and an exponent, without a sign. A number too small to be held reads
    // as 0.
    bool readNumber(double& value);
    // A number, a fraction such as 1/2, or both with blanks or a dash between them.
    bool readMixed(double& value);

private:
    bool readFraction(double& value);

    static constexpr std::size_t kShort = 64;
    char short_[kShort];
    std::string long_;
    char const* at_;
    char const* end_;
};

}  // namespace tzhost
