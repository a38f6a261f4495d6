// Runtime classes: one descriptor for each name, whoever asks, and none is left over.

#include "module/host_calls/class_registration.h"

#include <gtest/gtest.h>

namespace {

constexpr wchar_t const* kName = L"ClassOfThisTest";

TzRxClass* registerIn(TzRxClass*& descriptor) {
    return registerRuntimeClass(descriptor, kName, L"TzRxObject", nullptr);
}

TEST(RuntimeClasses, AreRegisteredOnceAndTakenBack) {
    TzRxClass* descriptor = nullptr;
    unregisterRuntimeClass(descriptor);  // does no harm
    TzRxClass* const made = registerIn(descriptor);
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(descriptor, made);
    EXPECT_EQ(tzrxFindTzRxClass(kName), made);
    EXPECT_EQ(registerIn(descriptor), made);
    unregisterRuntimeClass(descriptor);
    EXPECT_EQ(descriptor, nullptr);
    EXPECT_EQ(tzrxFindTzRxClass(kName), nullptr);
}

TEST(RuntimeClasses, AreMadeAnewWhenSomebodyTookThemOut) {
    TzRxClass* descriptor = nullptr;
    deleteTzRxClass(registerIn(descriptor));
    TzRxClass* const again = registerIn(descriptor);
    ASSERT_NE(again, nullptr);
    EXPECT_EQ(tzrxFindTzRxClass(kName), again);
    unregisterRuntimeClass(descriptor);
}

TEST(RuntimeClassesDeathTest, StopTheProcessWhenTheNameStandsForAnother) {
    testing::FLAGS_gtest_death_test_style = "threadsafe";
    TzRxClass* first = nullptr;
    registerIn(first);
    TzRxClass* other = TzRxObject::desc();
    EXPECT_DEATH(registerIn(other), "Class mismatch");
    unregisterRuntimeClass(first);
}

}  // namespace
