#include "host/command_line/question.h"

#include <utility>

#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "host/runtime/words.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

bool isText(QuestionKind kind) {
    return kind == QuestionKind::string || kind == QuestionKind::symbol;
}

// Of the keywords; a question for a text has none unless whoever asks it says so.
Offer usualOffer(QuestionKind kind, KeywordList const& words) {
    Offer asked = commandLine().takeOffer();
    if (isText(kind)) return asked;
    Offer offer{Offer::Kind::words};
    if (!commandLine().isPerson()) return offer;  // a script completes nothing
    for (int i = 0; i < words.count(); ++i) {
        offer.choices.push_back(words.local(i));
        offer.choices.push_back(L'_' + words.global(i));
    }
    return offer;
}

}  // namespace

std::optional<int> failsAt(std::string_view operation) {
    auto const fault = faultAt(operation);
    if (!fault) return std::nullopt;
    (void)commandLine().takeArmed();  // flags and offer were for this question alone
    (void)commandLine().takeOffer();
    return commandLine().failed(*fault);
}

Question::Question(QuestionKind kind, wchar_t const* prompt)
    : Question(kind, prompt, commandLine().takeArmed()) {}

Question::Question(QuestionKind kind, wchar_t const* prompt, Armed armed)
    : line_(commandLine()), kind_(kind), prompt_(prompt ? prompt : L""), armed_(std::move(armed)),
      offer_(usualOffer(kind, armed_.words)) {
    reportEvent([&] {
        return Event{{"event", "prompt"},
                     {"kind", nameOf(kind_)},
                     {"text", toUtf8(prompt_)},
                     {"keywords", toUtf8(armed_.list)},
                     {"flags", armed_.flags}};
    });
}

void Question::setEndings(int empty, int cancel) {
    emptyStatus_ = empty;
    cancelStatus_ = cancel;
}

int Question::ask(Reader const& read) {
    while (true) {
        Answer const answer = line_.ask({kind_, prompt_, offer_});
        switch (answer.kind) {
        case Answer::Kind::line:
            if (auto const status = take(answer.text, read)) return *status;
            break;
        case Answer::Kind::tooLong: line_.sayProblem(localText(L"That line is too long.")); break;
        case Answer::Kind::cancel: return line_.answered(L"^C", cancelStatus_);
        default: return line_.answered(L"", cancelStatus_);
        }
    }
}

std::optional<int> Question::take(std::wstring const& line, Reader const& read) {
    Reply const reply =
        replyTo(kind_ == QuestionKind::string ? line : withoutBlanksAround(line), read);
    line_.answered(line, reply.status);
    if (reply.kind == Reply::Kind::done) return reply.status;
    if (reply.kind == Reply::Kind::refused) line_.sayProblem(reply.complaint);
    return std::nullopt;
}

Reply Question::replyTo(std::wstring_view answer, Reader const& read) {
    if (answer.empty()) {
        if (armed_.has(Armed::kNoEmptyAnswer))
            return Reply::refused(localText(L"An answer is needed."));
        return Reply::done(emptyStatus_);
    }
    // Where any text is an answer, a word with a blank in it is such a text.
    auto index = armed_.words.match(answer);
    if (!index && !armed_.has(Armed::kFreeText)) index = armed_.words.matchShown(answer);
    if (index) {
        if (wordReader_) return wordReader_(*index);
        line_.leaveInput(armed_.words.global(*index));
        return Reply::done(Tzad::ePromptKeyword);
    }
    Reply reply = read(answer);
    if (reply.kind != Reply::Kind::unreadable) return reply;
    if (!armed_.has(Armed::kFreeText)) {
        if (kind_ != QuestionKind::keyword && armed_.words.count() > 0)
            reply.complaint += localText(L" One of the words in question will do, too.");
        return Reply::refused(std::move(reply.complaint));
    }
    line_.leaveInput(std::wstring(answer));
    return Reply::done(Tzad::ePromptKeyword);
}

std::optional<Reply> refusalOf(double value, Armed const& armed) {
    if (value == 0 && armed.has(Armed::kNoZero)) {
        return Reply::refused(localText(L"The value must not be zero."));
    }
    if (value < 0 && armed.has(Armed::kNoNegative)) {
        return Reply::refused(localText(L"The value must not be negative."));
    }
    return std::nullopt;
}

}  // namespace tzhost
