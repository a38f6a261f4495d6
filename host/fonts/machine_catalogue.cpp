#include "host/fonts/machine_catalogue.h"

#include <algorithm>
#include <cstdlib>
#include <tuple>
#include <unordered_map>

#include "host/files/ini_data.h"
#include "host/fonts/machine_fonts.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

int integerOf(FcPattern* pattern, char const* property, int otherwise) {
    int value = otherwise;
    return FcPatternGetInteger(pattern, property, 0, &value) == FcResultMatch ? value : otherwise;
}

std::wstring withoutFolder(std::wstring_view path) {
    std::size_t const slash = path.find_last_of(L"/\\");
    return std::wstring(slash == path.npos ? path : path.substr(slash + 1));
}

FontForm formOf(FcPattern* pattern) {
    FontForm form;
    form.path = fontText(pattern, FC_FILE, 0);
    form.fileName = withoutFolder(fromUtf8(form.path));
    form.index = integerOf(pattern, FC_INDEX, 0);
    form.weight = integerOf(pattern, FC_WEIGHT, FC_WEIGHT_REGULAR);
    form.slant = integerOf(pattern, FC_SLANT, FC_SLANT_ROMAN);
    form.width = integerOf(pattern, FC_WIDTH, FC_WIDTH_NORMAL);
    form.isFixedPitch = integerOf(pattern, FC_SPACING, FC_PROPORTIONAL) >= FC_MONO;
    FcCharSet* characters = nullptr;
    if (FcPatternGetCharSet(pattern, FC_CHARSET, 0, &characters) == FcResultMatch) {
        form.characters = characters;
    }
    return form;
}

// How far a form is from the one that is asked for; the file's name makes the order the same on
// every machine with the same files.
auto distance(FontForm const& form, bool bold, bool italic) {
    int const wanted = bold ? FC_WEIGHT_BOLD : FC_WEIGHT_REGULAR;
    return std::tuple(form.isItalic() != italic, form.isBold() != bold,
                      std::abs(form.width - FC_WIDTH_NORMAL), std::abs(form.weight - wanted),
                      std::wstring_view(form.fileName), form.index);
}

}  // namespace

FontForm const& FontFamilyRow::nearest(bool bold, bool italic) const {
    return **std::min_element(forms.begin(), forms.end(),
                              [=](FontForm const* a, FontForm const* b) {
                                  return distance(*a, bold, italic) < distance(*b, bold, italic);
                              });
}

bool FontFamilyRow::has(bool bold, bool italic) const {
    FontForm const& form = nearest(bold, italic);
    return form.isBold() == bold && form.isItalic() == italic;
}

FontCatalogue const& FontCatalogue::instance() {
    static FontCatalogue const catalogue;
    return catalogue;
}

FontCatalogue::FontCatalogue() {
    for (FcPattern* const pattern : machineFonts())
        add(pattern);
    nameForms();
}

void FontCatalogue::add(FcPattern* pattern) {
    auto const names = familyNames(pattern);
    if (names.empty()) return;
    FontForm const& form = forms_.emplace_back(formOf(pattern));
    auto const english = std::find_if(names.begin(), names.end(),
                                      [](FamilyName const& each) { return each.isEnglish; });
    auto const native = std::find_if(names.begin(), names.end(),
                                     [](FamilyName const& each) { return !each.isEnglish; });
    for (FamilyName const& each : names) {
        FontFamilyRow& row = byName_[lowered(each.name)];
        row.forms.push_back(&form);
        if (!row.english.empty()) continue;
        row.english = each.isEnglish ? each.name : english->name;
        row.native = native == names.end() ? row.english : native->name;
    }
    auto const [at, isNew] = byFile_.try_emplace(lowered(form.fileName), &form);
    if (!isNew && form.index < at->second->index) at->second = &form;
}

// Gives each form an English family name under which it is the nearest form, so that going from the
// file to the face and back ends at the same file. A form may have several names: a condensed form
// may also have the plain name of its family, under which another form is nearer.
void FontCatalogue::nameForms() {
    struct Name {
        std::wstring const* english = nullptr;
        bool leadsBack = false;
    };
    std::unordered_map<FontForm const*, Name> names;
    for (FontFamilyRow const* const row : families()) {
        for (FontForm const* const form : row->forms) {
            Name& name = names[form];
            if (name.leadsBack) continue;
            name.leadsBack = &row->nearest(form->isBold(), form->isItalic()) == form;
            if (!name.english || name.leadsBack) name.english = &row->english;
        }
    }
    for (FontForm& form : forms_) {
        if (auto const at = names.find(&form); at != names.end())
            form.english = *at->second.english;
    }
}

FontFamilyRow const* FontCatalogue::family(std::wstring_view name) const {
    auto const at = byName_.find(lowered(name));
    return at == byName_.end() ? nullptr : &at->second;
}

FontForm const* FontCatalogue::file(std::wstring_view name) const {
    auto const at = byFile_.find(lowered(withoutFolder(name)));
    return at == byFile_.end() ? nullptr : at->second;
}

std::vector<FontFamilyRow const*> FontCatalogue::families() const {
    std::vector<FontFamilyRow const*> rows;
    for (auto const& [key, row] : byName_) {
        if (lowered(row.english) == key) rows.push_back(&row);
    }
    return rows;
}

}  // namespace tzhost
