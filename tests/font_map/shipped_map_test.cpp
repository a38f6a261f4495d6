// The font map file that is shipped: every line is read as it was meant, nothing hides another
// line, and it agrees with the fonts themselves where they are at hand.

#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "host/fonts/font_map_path.h"
#include "tz/mte/font_map_database.h"
#include "tz/pal/ini_file.h"
#include "tz/text/font_info.h"

namespace {

using Fonts = CMTextFontMapDatabase;

// What a file looks like: face|bold|italic|charset|pitch|type.
using Look = std::string;

struct Line {
    std::string section, key, value;
    std::vector<std::string> fields;
};

std::vector<std::string> splitAt(char sign, std::string const& text) {
    std::vector<std::string> parts;
    std::istringstream stream(text);
    for (std::string part; std::getline(stream, part, sign);)
        parts.push_back(part);
    return parts;
}

class ShippedMap : public testing::Test {
protected:
    ShippedMap() : before_(tzhost::setFontMapFile({})) {
        Fonts(0).ResetContents();
        std::ifstream file(GetMTextMapFilename().toUtf8());
        std::string section;
        for (std::string text; std::getline(file, text);) {
            if (text.empty() || text.front() == ';') continue;
            if (text.front() == '[') {
                section = text.substr(1, text.size() - 2);
                continue;
            }
            std::size_t const sign = text.find('=');
            EXPECT_NE(sign, std::string::npos) << text;
            std::string const value = text.substr(sign + 1);
            lines_.push_back({section, text.substr(0, sign), value, splitAt(',', value)});
        }
    }
    ~ShippedMap() override {
        Fonts(0).ResetContents();
        tzhost::setFontMapFile(before_);
    }

    // The mapping lines of the three sections.
    [[nodiscard]] std::vector<Line> mappings() const {
        std::vector<Line> found;
        for (Line const& line : lines_) {
            if (kTypes.count(line.section) != 0 && line.key != "OneWaySubstitution")
                found.push_back(line);
        }
        return found;
    }
    [[nodiscard]] bool isOneWay(std::string const& section) const {
        for (Line const& line : lines_) {
            if (line.section == section && line.key == "OneWaySubstitution")
                return line.value == "1";
        }
        return false;
    }

    static std::map<std::string, Fonts::MapType> const kTypes;
    std::vector<Line> lines_;

private:
    std::string before_;
};
std::map<std::string, Fonts::MapType> const ShippedMap::kTypes{
    {"SHX Map", Fonts::MapTypeShx},
    {"Postscript Map", Fonts::MapTypePostscript},
    {"Misc Map", Fonts::MapTypeMisc},
};

Look lookOf(
    std::string const& face, bool bold, bool italic, int charset, int pitch, Fonts::MapType type) {
    std::ostringstream text;
    text << face << '|' << bold << '|' << italic << '|' << charset << '|' << pitch << '|' << type;
    return text.str();
}

TEST_F(ShippedMap, HasWellFormedLinesOfItsFourSections) {
    std::set<int> const charsets{0,   1,   128, 129, 130, 134, 136, 161,
                                 162, 163, 177, 178, 186, 204, 222, 238};
    std::set<std::string> keys;
    for (Line const& line : mappings()) {
        SCOPED_TRACE(line.key);
        EXPECT_TRUE(keys.insert(line.key).second);
        EXPECT_EQ(line.key.find_first_of("ABCDEFGHIJKLMNOPQRSTUVWXYZ\\/ "), std::string::npos);
        ASSERT_GE(line.fields.size(), 5U);
        EXPECT_FALSE(line.fields[0].empty());
        EXPECT_EQ(line.fields[0].find_first_of(";|{}\\"), std::string::npos);
        for (std::size_t at : {1U, 2U})
            EXPECT_TRUE(line.fields[at] == "0" || line.fields[at] == "1");
        std::set<int> own;
        for (std::size_t at = 3; at < line.fields.size(); ++at) {
            int const number = std::stoi(line.fields[at]);
            EXPECT_EQ(std::to_string(number), line.fields[at]);
            if (at == 4) {
                EXPECT_LE(number & 0x0F, 2);
                EXPECT_LE(number, 0x52);
            } else {
                EXPECT_EQ(charsets.count(number), 1U) << number;
                EXPECT_TRUE(own.insert(number).second) << number;
            }
        }
    }
    for (Line const& line : lines_)
        EXPECT_TRUE(line.section == "Proxy Fonts" || kTypes.count(line.section) != 0)
            << line.section;
    EXPECT_GT(keys.size(), 200U);
}

TEST_F(ShippedMap, LeadsFromEachFileToItsFaceAndBackWhereItMay) {
    Fonts fonts(0);
    for (Line const& line : mappings()) {
        SCOPED_TRACE(line.key);
        auto const& fields = line.fields;
        Fonts::MapType type = Fonts::MapTypeAll;
        bool bold = false;
        bool italic = false;
        Charset charset = kAnsiCharset;
        int pitch = 0;
        CStdStrW const key(TzString::fromUtf8(line.key));
        CStdStrW const face = fonts.MapFileToFont(type, key, bold, italic, charset, pitch);
        EXPECT_EQ(lookOf(TzString(face).toUtf8(), bold, italic, charset, pitch, type),
                  lookOf(fields[0], fields[1] == "1", fields[2] == "1",
                         std::stoi(fields.size() == 5 ? fields[3] : fields.back()),
                         std::stoi(fields[4]), kTypes.at(line.section)));
        for (std::size_t at = 3; at < fields.size(); at += at == 3 ? 2 : 1) {
            auto const set = static_cast<Charset>(std::stoi(fields[at]));
            CStdStrW const file = fonts.MapFontToFile(type, face, bold, italic, set, pitch);
            if (isOneWay(line.section))
                EXPECT_EQ(type, Fonts::MapTypeSystem);
            else
                EXPECT_EQ(TzString(file).toUtf8(), line.key) << fields[at];
        }
    }
}

// A text of a typeface must not turn into strokes because a stroke font was called after it.
TEST_F(ShippedMap, GivesStrokeFontsAndProxiesFacesOfTheirOwn) {
    std::map<std::string, std::string> owners;
    for (Line const& line : mappings()) {
        if (isOneWay(line.section)) owners.emplace(line.fields[0], "a typeface");
    }
    auto const claim = [&owners](std::string const& face, std::string const& owner) {
        auto const [at, isNew] = owners.emplace(face, owner);
        EXPECT_TRUE(isNew) << face << ": " << owner << ", " << at->second;
    };
    int proxies = 0;
    for (Line const& line : lines_) {
        if (line.section == "SHX Map") claim(line.fields[0], line.key);
        if (line.section != "Proxy Fonts" || line.key == "Default") continue;
        claim(line.value, line.key);
        if (line.key != "Default Bigfont Proxy") {
            EXPECT_EQ(line.key, "Proxy " + std::to_string(++proxies));
        }
    }
    EXPECT_GE(proxies, 9);
}

TEST_F(ShippedMap, AgreesWithTheFontsAtHand) {
    int count = 0;
    for (Line const& line : mappings()) {
        CStdStrW face;
        bool bold = false;
        bool italic = false;
        Charset charset = kAnsiCharset;
        FontPitch pitch = FontPitch::kDefault;
        FontFamily family = FontFamily::kDoNotCare;
        if (!tzFontInfo().FileToFontName(CStdStrW(TzString::fromUtf8(line.key)), face, bold, italic,
                                         charset, pitch, family))
            continue;
        ++count;
        std::ostringstream value;
        value << TzString(face).toUtf8() << ',' << bold << ',' << italic << ',' << charset << ','
              << getPitchAndFamilyValueFromEnum(pitch, family);
        EXPECT_EQ(line.value, value.str()) << line.key;
    }
    EXPECT_GE(count, 13);
}

}  // namespace
