// The real module in the real host: what it registers, in which order, what it answers to each
// message, and that nothing of it stays.

#include <dlfcn.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <memory>

#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "host/database/drawing.h"
#include "host/platform/output.h"
#include "host/resources/resource_search.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/documents.h"
#include "host/runtime/functions.h"
#include "host/runtime/module_linker.h"
#include "host/settings/settings.h"
#include "tz/rx/class.h"
#include "tz/rx/resbuf.h"

namespace {

namespace fs = std::filesystem;

struct Prints : tzhost::PrintSink {
    void print(std::wstring_view text) override { printed += text; }
    std::wstring printed;
};

class Module : public testing::Test {
protected:
    Module() {
        tzhost::setPrintSink(&prints_);
        tzhost::setEventSink([this](tzhost::Event const& event) { note(event); });
        tzhost::setWorkingDrawing(drawing_.get());
        tzhost::documents().open(drawing_.get());
    }
    ~Module() override {
        tzhost::setFaultHook(nullptr);
        tzhost::setResourceSearch({});
        tzhost::settings().denied.clear();
        tzhost::dynamicLinker().unloadAll();
        tzhost::documents().close();
        tzhost::setWorkingDrawing(nullptr);
        tzhost::setEventSink({});
        tzhost::setPrintSink(nullptr);
    }

    bool load() { return tzhost::dynamicLinker().load(file_, error_); }
    bool unload() { return tzhost::dynamicLinker().unload(file_, error_); }
    int send(int message) {
        return tzhost::dynamicLinker().send(*tzhost::dynamicLinker().modules().front(),
                                            static_cast<TzRx::AppMsgCode>(message));
    }
    // A variable that the module exports.
    template <class T>
    T& exported(char const* name) {
        return *static_cast<T*>(
            dlsym(tzhost::dynamicLinker().modules().front()->loaderHandle, name));
    }

    // Registrations as "what name", with "-" before those taken back; a line of the debug output
    // as "debug".
    std::string registered_;
    std::string debug_;  // those lines themselves
    std::string error_;
    Prints prints_;
    std::unique_ptr<tzhost::Drawing> drawing_ = tzhost::Drawing::create();
    fs::path const file_ = fs::path(std::getenv("TZ_TEST_LIB")) / "tzmted.tzx";

private:
    void note(tzhost::Event const& event) {
        if (event.at("event") == "debug") {
            registered_ += "debug\n";
            debug_ += event.at("text").get<std::string>();
        }
        if (event.at("event") != "register") return;
        registered_ += (event.at("on").get<bool>() ? "" : "-") +
                       event.at("what").get<std::string>() + " " +
                       event.at("name").get<std::string>() + "\n";
    }
};

TEST_F(Module, RegistersAndTakesBackInItsOrder) {
    ASSERT_TRUE(load()) << error_;
    EXPECT_EQ(registered_,
              "class TzxEditMtext\nclass TzxMtextCommand\nclass TzApHostRawEditorParamsFrameless\n"
              "class TzApHostOldEditorParamsFrameless\nservice TzMTextService_TZC\n"
              "command MTEDIT\ndebug\nhelp MTEDIT\nhelp MTEDIT\n"
              "command -MTEDIT\ndebug\nhelp -MTEDIT\nhelp -MTEDIT\n"
              "command TEXTALIGN\ndebug\nhelp TEXTALIGN\nhelp TEXTALIGN\n"
              "command MTEXT\ndebug\nhelp MTEXT\nhelp MTEXT\n"
              "command -MTEXT\ndebug\nhelp -MTEXT\nhelp -MTEXT\n"
              "command MTPROP\ndebug\nhelp MTPROP\nhelp MTPROP\n"
              "command MTEXTPROPERTIES\n"
              "function MTEDIT\nfunction TEXTALIGN\nfunction MTPROP\n"
              "help MTEDIT\nhelp MTEDIT\nhelp TEXTALIGN\nhelp TEXTALIGN\n");
    EXPECT_EQ(debug_.substr(0, debug_.find('\n') + 1),
              "  Registered command under the global name 'MTEDIT' and local name 'MTEDIT'\r\n");
    EXPECT_EQ(tzhost::commandStack().find(L"MTEDIT")->flags, 0x2);
    EXPECT_EQ(tzhost::commandStack().find(L"MTEXTPROPERTIES")->flags, 0x800002);
    EXPECT_EQ(tzhost::findHelp(L"MTEXTPROPERTIES"), nullptr);
    EXPECT_NE(tzrxFindTzRxClass(L"TzxMtextCommand"), nullptr);

    registered_.clear();
    ASSERT_TRUE(unload()) << error_;
    EXPECT_EQ(registered_.substr(0, registered_.find("-command")),
              "-function MTEDIT\n-function TEXTALIGN\n-function MTPROP\n-class TzxEditMtext\n"
              "-class TzxMtextCommand\n-class TzApHostRawEditorParamsFrameless\n"
              "-class TzApHostOldEditorParamsFrameless\n-service TzMTextService_TZC\n");
    EXPECT_EQ(tzhost::commandStack().find(L"MTEDIT"), nullptr);
    EXPECT_EQ(tzhost::commandStack().find(L"MTEXTPROPERTIES"), nullptr);
    EXPECT_EQ(tzrxFindTzRxClass(L"TzxMtextCommand"), nullptr);
}

TEST_F(Module, IgnoresOtherMessages) {
    ASSERT_TRUE(load()) << error_;
    registered_.clear();
    for (int message : {0, 6, -1, 2147483647})
        EXPECT_EQ(send(message), 0) << message;
    EXPECT_EQ(registered_, "");
}

TEST_F(Module, IsNotLoadedWithoutItsTexts) {
    tzhost::setResourceSearch({"", "", "/nonexistent/TzmtedRes.dll"});
    EXPECT_FALSE(load());
    EXPECT_NE(error_.find("status 3"), std::string::npos) << error_;
    EXPECT_EQ(registered_, "");
    tzhost::setResourceSearch({});
    EXPECT_TRUE(load()) << "its texts are looked for anew: " << error_;
}

TEST_F(Module, IsLoadedWhateverTheHostRefuses) {
    tzhost::setFaultHook([](std::string_view operation, int&) {
        return operation == "newTzRxClass" || operation == "TzEdCommandStack::addCommand" ||
               operation == "tzedSetFunHelp";
    });
    ASSERT_TRUE(load()) << error_;
    EXPECT_EQ(tzhost::commandStack().find(L"MTEDIT"), nullptr);
    tzhost::setFaultHook(nullptr);
    registered_.clear();
    ASSERT_TRUE(unload()) << error_;
    EXPECT_EQ(registered_, "-function MTEDIT\n-function TEXTALIGN\n-function MTPROP\n"
                           "-service TzMTextService_TZC\n");
}

TEST_F(Module, StopsDefiningAtTheFirstRefusal) {
    ASSERT_TRUE(load()) << error_;
    EXPECT_EQ(send(4), 0);
    static int calls;
    calls = 0;
    tzhost::setFaultHook(
        [](std::string_view operation, int&) { return operation == "tzedDefun" && ++calls == 2; });
    registered_.clear();
    EXPECT_EQ(send(3), 3);
    EXPECT_EQ(registered_, "function MTEDIT\n");
    tzhost::setFaultHook(nullptr);
    EXPECT_EQ(send(4), 0);
    EXPECT_EQ(send(3), 0);
}

struct CallRow {
    wchar_t const* name;
    int argumentType;  // 0: no argument
    int result;
    bool wantsEntity;  // prints that it does
};
constexpr CallRow kCalls[] = {
    {L"MTEDIT", 0, 0, true},
    {L"MTEDIT", Tzad::eResultString, 0, true},
    {L"MTEDIT", Tzad::eResultEntityName, 0, false},
    {L"MTPROP", Tzad::eResultReal, 0, true},
    {L"MTPROP", Tzad::eResultEntityName, 0, false},
    {L"TEXTALIGN", 0, 3, false},
    {L"TEXTALIGN", Tzad::eResultEntityName, 3, false},
};
TEST_F(Module, AnswersTheInterpreter) {
    ASSERT_TRUE(load()) << error_;
    for (CallRow const& row : kCalls) {
        resbuf* const arguments = row.argumentType == 0 ? nullptr : tzutNewRb(row.argumentType);
        prints_.printed.clear();
        EXPECT_EQ(tzhost::callFunction(row.name, arguments), row.result)
            << row.name << row.argumentType;
        EXPECT_EQ(prints_.printed.find(L"one entity name") != std::wstring::npos, row.wantsEntity)
            << row.name << row.argumentType;
        tzutRelRb(arguments);
    }
}

TEST_F(Module, AsksWhetherFieldsAreAllowed) {
    ASSERT_TRUE(load()) << error_;
    EXPECT_EQ(exported<std::uint8_t>("g_bEnableFieldUI"), 1);
    ASSERT_TRUE(unload()) << error_;
    tzhost::settings().denied = {L"FIELD"};
    ASSERT_TRUE(load()) << error_;
    EXPECT_EQ(exported<std::uint8_t>("g_bEnableFieldUI"), 0);
}

bool isInProcess(fs::path const& file) {
    std::ifstream maps("/proc/self/maps");
    for (std::string line; std::getline(maps, line);)
        if (line.find(file.filename().string()) != std::string::npos) return true;
    return false;
}

TEST_F(Module, LeavesTheProcessAndComesBackFresh) {
    for (int round = 0; round < 3; ++round) {
        ASSERT_TRUE(load()) << error_;
        EXPECT_TRUE(isInProcess(file_));
        EXPECT_EQ(exported<double>("gdJigBoundBoxHeight"), 0);
        exported<double>("gdJigBoundBoxHeight") = 7;
        ASSERT_TRUE(unload()) << error_;
        EXPECT_FALSE(isInProcess(file_));
    }
}

}  // namespace
