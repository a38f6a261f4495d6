#pragma once

#include <string>
#include <string_view>

// A text as an editor gets it and gives it back: the bytes of the file that a program opens, or the
// lines of a script's block. One class for each form in which texts are edited; the session
// (editor_session.h) knows none of them.
namespace tzhost {

// What became of a text that an editor left.
enum class Taken {
    unchanged,  // it says what it said before, and nothing was touched
    changed,    // it was stored
    refused,    // nothing was touched; `problem` says why
};

struct TakenText {
    Taken taken = Taken::refused;
    std::string problem;  // one clause with the editor as its subject, such as "left an empty file"
};

// What an editor left without the byte-order mark that some of them write first.
[[nodiscard]] inline std::string_view withoutByteOrderMark(std::string_view left) {
    return left.substr(left.starts_with("\xEF\xBB\xBF") ? 3 : 0);
}

class EditedText {
public:
    EditedText() = default;
    EditedText(EditedText const&) = delete;
    EditedText& operator=(EditedText const&) = delete;
    virtual ~EditedText() = default;

    // The name of the file that a program opens. Its ending tells the program what the file holds.
    [[nodiscard]] virtual char const* fileName() const = 0;
    // The bytes of that file.
    [[nodiscard]] virtual std::string bytes() const = 0;
    // Whether there is no text yet, so that leaving it unchanged makes none.
    [[nodiscard]] virtual bool isEmpty() const = 0;
    // Stores the bytes that the editor left, which are at least one.
    [[nodiscard]] virtual TakenText take(std::string_view left) = 0;
};

}  // namespace tzhost
