// What must be given back is given back, and only once.

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "host/platform/output.h"
#include "module/holders/handle_object.h"
#include "module/holders/scope_guard.h"
#include "module/uncalled/class_id.h"
#include "module/uncalled/elapsed_time.h"
#include "tz/mte/easy_object.h"

namespace {

// Writes down what is done to it.
struct Noted {
    explicit Noted(std::string& notes) : notes_(notes) {}
    virtual ~Noted() { notes_ += "d"; }
    void close() { notes_ += "c"; }
    std::string& notes_;
};

template <class Holder>
std::string notesOf(unsigned int flags) {
    std::string notes;
    auto* const object = new Noted(notes);
    { Holder const holder(object, flags); }
    std::string const result = notes;
    if (result.find('d') == std::string::npos) delete object;
    return result;
}

TEST(EasyHolders, DoWhatTheirFlagsSay) {
    struct Row {
        unsigned int flags;
        char const* held;
        char const* iterated;
    };
    for (Row const& row : {Row{0, "", ""}, {1, "c", ""}, {2, "d", "d"}, {3, "cd", "d"}}) {
        EXPECT_EQ((notesOf<EasyObject<Noted>>(row.flags)), row.held);
        EXPECT_EQ((notesOf<EasyTable<Noted>>(row.flags)), row.held);
        EXPECT_EQ((notesOf<EasyIterator<int, Noted>>(row.flags)), row.iterated);
    }
}

TEST(EasyHolders, LeaveAloneWhatWasTakenOut) {
    std::string notes;
    Noted object(notes);
    {
        EasyObject<Noted> holder(&object);
        EXPECT_EQ(holder.flags, EasyFlags::kClose);
        holder.object = nullptr;
    }
    EXPECT_EQ(notes, "");
}

TEST(HandleObject, RefusesTheInvalidHandleAndKeepsItsOwn) {
    int something = 0;
    void* const invalid = reinterpret_cast<void*>(~std::uintptr_t{0});
    CHandleObject holder;
    EXPECT_FALSE(holder.IsAttached());
    EXPECT_FALSE(holder.Close());
    EXPECT_TRUE(holder.Attach(&something));
    EXPECT_FALSE(holder.Attach(invalid));
    EXPECT_EQ(holder.Handle(), &something);
    EXPECT_FALSE(holder = nullptr);
    EXPECT_FALSE(holder.IsAttached());
    EXPECT_TRUE(holder = &something);
    EXPECT_EQ(holder.Detach(), &something);
    EXPECT_EQ(static_cast<void*>(holder), nullptr);
    EXPECT_TRUE(holder.Attach(&something));
    EXPECT_TRUE(holder.Close());
    EXPECT_FALSE(holder.IsAttached());
}

TEST(ScopeGuard, LeavesOnEveryWayOut) {
    std::string notes;
    auto const note = [&notes](char const* what) { return [&notes, what] { notes += what; }; };
    { TzScopeGuard const guard(note("enter "), note("leave ")); }
    { TzScopeGuard const guard(nullptr, note("leave ")); }
    { TzScopeGuard const guard(note("enter "), nullptr); }
    try {
        TzScopeGuard const guard(note("enter "), note("leave "));
        throw std::runtime_error("out");
    } catch (std::runtime_error const&) {
        notes += "caught ";
    }
    EXPECT_EQ(notes, "enter leave leave enter enter leave caught ");
    notes.clear();
    EXPECT_THROW(TzScopeGuard([] { throw std::runtime_error("in"); }, note("leave")),
                 std::runtime_error);
    EXPECT_EQ(notes, "");
}

struct DebugNotes : tzhost::DebugSink {
    void debug(std::wstring_view text) override { lines += text; }
    std::wstring lines;
};

TEST(ElapsedTime, MarksNestedBlocks) {
    DebugNotes notes;
    auto* const before = tzhost::setDebugSink(&notes);
    {
        CElapsedTime const outer(L"outer");
        CElapsedTime inner(L"inner");
        EXPECT_EQ(CElapsedTime::m_uInstanceCount, 2U);
        inner.Mark(nullptr);
    }
    tzhost::setDebugSink(before);
    EXPECT_EQ(CElapsedTime::m_uInstanceCount, 0U);
    // Each line without its times, which differ from run to run.
    std::vector<std::wstring> heads;
    for (std::size_t at = 0, end; (end = notes.lines.find(L'\n', at)) != std::wstring::npos;
         at = end + 1) {
        std::wstring const line = notes.lines.substr(at, end - at);
        heads.push_back(line.substr(0, line.find(L')') + 1));
        EXPECT_NE(line.find(L"(+"), std::wstring::npos);
        EXPECT_EQ(line.back(), L']');
    }
    EXPECT_EQ(heads,
              (std::vector<std::wstring>{L"outer (begin)", L"  inner (begin)", L"  inner (none)",
                                         L"  inner (end)", L"outer (end)"}));
}

TEST(ClassId, IsATextOfTheCallersOwn) {
    CStdStrW text(L"before");
    EXPECT_EQ(StringFromCLSID(_GUID{0x21401, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}}, text), 0);
    EXPECT_EQ(text, L"{00021401-0000-0000-C000-000000000046}");
}

}  // namespace
