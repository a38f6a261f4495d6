#include <gtest/gtest.h>

#include <memory>

#include "host/runtime/command_stack.h"
#include "host/runtime/documents.h"
#include "host/runtime/functions.h"
#include "tz/rx/class.h"
#include "tz/rx/registry.h"
#include "tz/rx/resource.h"
#include "tz/rx/status.h"

namespace {

using namespace tzhost;

class Probe : public TzRxObject {
public:
    explicit Probe(bool* deleted = nullptr) : deleted_(deleted) {}
    Probe(Probe const&) = delete;
    Probe& operator=(Probe const&) = delete;
    ~Probe() override {
        if (deleted_) *deleted_ = true;
    }
    TzRxClass* isA() const override { return theClass; }
    static TzRxClass* theClass;

private:
    bool* deleted_;
};
TzRxClass* Probe::theClass = nullptr;

TEST(Classes, FindParentsWhenTheHierarchyIsBuiltAndForgetDeletedOnes) {
    TzRxClass* const base = newTzRxClass(
        L"ProbeBase", L"TzRxObject", 0, [] { return static_cast<TzRxObject*>(new Probe); }, nullptr,
        nullptr);
    TzRxClass* const derived =
        newTzRxClass(L"ProbeDerived", L"ProbeBase", 0, nullptr, nullptr, nullptr);
    EXPECT_EQ(newTzRxClass(L"ProbeBase", L"TzRxObject", 0, nullptr, nullptr, nullptr), nullptr);
    EXPECT_FALSE(derived->isDerivedFrom(base));
    tzrxBuildClassHierarchy();
    EXPECT_TRUE(derived->isDerivedFrom(base));
    EXPECT_TRUE(derived->isDerivedFrom(TzRxObject::desc()));
    EXPECT_FALSE(base->isDerivedFrom(derived));
    EXPECT_EQ(derived->create(), nullptr);
    EXPECT_NE(std::unique_ptr<TzRxObject>(base->create()), nullptr);

    Probe::theClass = derived;
    Probe object;
    Probe extension;
    EXPECT_EQ(object.queryX(TzRxObject::desc()), nullptr);
    base->addX(TzRxObject::desc(), &extension);
    EXPECT_EQ(object.queryX(TzRxObject::desc()), &extension);  // of the nearest parent that has it

    deleteTzRxClass(derived);
    deleteTzRxClass(base);
    EXPECT_EQ(tzrxFindTzRxClass(L"ProbeBase"), nullptr);
}

TEST(Dictionary, OwnsWhatItHoldsAndHandsOverWhatIsTakenOut) {
    TzRxDictionary* const services =
        static_cast<TzRxDictionary*>(tzrxSysRegistry()->at(L"ServiceDictionary"));
    bool deleted = false;
    TzRxObject* const first = tzrxRegisterService(L"Probe service");
    EXPECT_EQ(tzrxRegisterService(L"Probe service"),
              first);  // a name that is there keeps its object
    EXPECT_EQ(services->atPut(L"Probe service", new Probe(&deleted)), first);
    delete first;
    std::unique_ptr<TzRxObject> const taken(services->remove(L"Probe service"));
    EXPECT_NE(taken, nullptr);
    EXPECT_FALSE(deleted);
    EXPECT_EQ(services->remove(L"Probe service"), nullptr);
}

struct NameCase {
    char const* name;
    wchar_t const* typed;
    wchar_t const* found;  // the global name, or null
};
constexpr NameCase kNames[] = {
    {"Global", L"PROBE", L"PROBE"},
    {"AnyCase", L"probe", L"PROBE"},
    {"Local", L"SONDE", L"PROBE"},
    {"UnderscoreGlobal", L"_probe", L"PROBE"},
    {"UnderscoreNoLocal", L"_sonde", nullptr},
    {"Dot", L".sonde", L"PROBE"},
    {"DotUnderscore", L"._PROBE", L"PROBE"},
    {"LocalBeforeGlobal", L"OTHER", L"PROBE2"},
    {"GlobalByUnderscore", L"_OTHER", L"OTHER"},
    {"Unknown", L"nothing", nullptr},
    {"Empty", L"", nullptr},
};
class CommandNames : public testing::TestWithParam<NameCase> {};

TEST_P(CommandNames, Find) {
    CommandStack stack;
    auto const add = [&](wchar_t const* global, wchar_t const* local) {
        return stack.addCommand(
            L"G", global, local, 0, [] {}, nullptr, -1, TzRxResourceInstance::empty, nullptr);
    };
    ASSERT_EQ(add(L"OTHER", L"ANDERES"), Tzad::eOk);
    ASSERT_EQ(add(L"PROBE", L"SONDE"), Tzad::eOk);
    ASSERT_EQ(add(L"PROBE2", L"OTHER"), Tzad::eOk);
    EXPECT_NE(add(L"Probe", L"X"), Tzad::eOk);
    EXPECT_NE(add(L"", L"X"), Tzad::eOk);
    Command const* const command = stack.find(GetParam().typed);
    ASSERT_EQ(command != nullptr, GetParam().found != nullptr);
    if (command) {
        EXPECT_STREQ(command->globalName, GetParam().found);
    }
    EXPECT_EQ(stack.removeGroup(L"G"), Tzad::eOk);
    EXPECT_TRUE(stack.commands().empty());
    EXPECT_NE(stack.removeGroup(L"G"), Tzad::eOk);
}
INSTANTIATE_TEST_SUITE_P(Typed, CommandNames, testing::ValuesIn(kNames), [](auto const& row) {
    return row.param.name;
});

TEST(Functions, BelongToTheDrawingThatIsOpen) {
    EXPECT_EQ(tzedDefun(L"PROBE", 7), Tzad::ePromptError);  // no drawing
    documents().open(nullptr);
    EXPECT_EQ(tzedDefun(L"PROBE", 7), Tzad::ePromptNormal);
    EXPECT_EQ(tzedDefun(L"probe", 8), Tzad::ePromptError);  // taken
    EXPECT_EQ(tzedUndef(L"PROBE", 8), Tzad::ePromptError);  // another code
    EXPECT_EQ(tzedUndef(L"PROBE", 7), Tzad::ePromptNormal);
    EXPECT_EQ(tzedGetFunCode(), Tzad::ePromptError);  // outside a call
    EXPECT_EQ(callFunction(L"PROBE", nullptr), -1);
    documents().close();
}

}  // namespace
