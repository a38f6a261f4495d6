// Printed texts, messages, and what of them the events show.

#include <gtest/gtest.h>

#include <string>

#include "host/base/event_sink.h"
#include "host/platform/output.h"
#include "host/settings/variables.h"
#include "tz/ed/print.h"
#include "tz/ed/variables.h"
#include "tz/ed/warning.h"
#include "tz/pal/diagnostics.h"
#include "tz/pal/message_box.h"
#include "tz/rx/status.h"

namespace {

// Gathers events and everything that is shown.
class Output : public testing::Test,
               protected tzhost::PrintSink,
               protected tzhost::NotificationSink {
protected:
    Output() {
        oldPrint_ = tzhost::setPrintSink(this);
        oldNotification_ = tzhost::setNotificationSink(this);
        oldEvents_ = tzhost::setEventSink(
            [this](tzhost::Event const& event) { events_ += event.dump() + "\n"; });
    }
    ~Output() override {
        tzhost::setPrintSink(oldPrint_);
        tzhost::setNotificationSink(oldNotification_);
        tzhost::setEventSink(oldEvents_);
    }
    void print(std::wstring_view text) override { shown_ += text; }
    void showTextScreen() override { shown_ += L"[text screen]"; }
    void notify(tzhost::Notification const& message) override {
        shown_ += L"<" + message.text + (message.printed ? L"|printed>" : L">");
    }

    std::wstring shown_;
    std::string events_;

private:
    tzhost::PrintSink* oldPrint_;
    tzhost::NotificationSink* oldNotification_;
    tzhost::EventSink oldEvents_;
};

TEST_F(Output, IsFormattedAndPrinted) {
    EXPECT_EQ(tzutPrintf(L"\n%s: %d%%", L"Größe", 7), Tzad::ePromptNormal);
    EXPECT_EQ(tzedTextScr(), Tzad::ePromptNormal);
    EXPECT_EQ(shown_, L"\nGröße: 7%[text screen]");
    EXPECT_EQ(events_, "");  // the command line knows who printed
}

TEST_F(Output, ShowsMessagesAndReportsThem) {
    EXPECT_EQ(MessageBox(nullptr, L"Too new", nullptr, kMessageBoxError), 1);
    EXPECT_EQ(TwHostMessageBox::simple(L"Locked", kMessageBoxError), 1);
    tzutWarning(L"TzMte12167", true, L"2 found, 100%% of them\n50% left");
    EXPECT_EQ(shown_, L"<Too new><Locked><2 found, 100% of them\n50|printed>");
    EXPECT_EQ(events_, R"({"event":"messageBox","id":"","text":"Too new","style":16}
{"event":"messageBox","id":"","text":"Locked","style":16}
{"event":"warning","id":"TzMte12167","text":"2 found, 100% of them\n50","style":0}
)");
}

TEST_F(Output, ForDevelopersIsAnEventAsItStands) {
    OutputDebugString(L"100%d");
    Tzworks::Tzdraft::PAL::Diagnostics::outputDebugString(L"x\r\n");
    EXPECT_EQ(events_, "{\"event\":\"debug\",\"text\":\"100%d\"}\n"
                       "{\"event\":\"debug\",\"text\":\"x\\r\\n\"}\n");
}

TEST_F(Output, ReportsWhatModulesWriteToVariables) {
    auto& store = tzhost::Variables::instance();
    auto const before = store.snapshot();
    resbuf record{nullptr, Tzad::eResultPoint3d, {}};
    record.resval.rpoint[0] = 1.5;
    EXPECT_EQ(tzedSetVar(L"lastpoint", &record), Tzad::ePromptNormal);
    record.restype = Tzad::eResultReal;
    record.resval.rreal = -1;
    EXPECT_EQ(tzedSetVar(L"TEXTSIZE", &record), Tzad::ePromptError);
    EXPECT_TRUE(store.set(L"TEXTSIZE", 3.0, tzhost::Writer::user).isDone());
    EXPECT_EQ(events_, "{\"event\":\"variable\",\"name\":\"LASTPOINT\",\"value\":[1.5,0.0,0.0]}\n");
    store.restore(before);
}

}  // namespace
