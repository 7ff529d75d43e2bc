#include "oesdk.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <thread>
#include <vector>

namespace {
struct Message {
    int severity, subSeverity, line;
    std::string source, function, text;
};
std::vector<Message> g_log;
void Capture(int s, int ss, const char* src, int line, const char* fn, const char* text) {
    g_log.push_back({s, ss, line, src, fn, text});
}
int g_pumps = 0;
int CountingPump(void*) {
    return ++g_pumps >= 2;
}
} // namespace

TEST(Platform, MessageLogIsReplaceable) {
    Util::MessageFunctor old = Util::GetOps().SetMessageFunctor(&Capture);
    EXPECT_EQ(old, &Util::DefaultMessageFunctor);
    g_log.clear();
    Util::GetOps().Message(2, 7, "oenetacc", 42, "Fn", "value %d of %s", 5, "x");
    Util::GetOps().SetMessageFunctor(nullptr);
    EXPECT_EQ(Util::GetOps().GetMessageFunctor(), &Util::DefaultMessageFunctor);
    ASSERT_EQ(g_log.size(), 1u);
    EXPECT_EQ(g_log[0].severity, 2);
    EXPECT_EQ(g_log[0].subSeverity, 7);
    EXPECT_EQ(g_log[0].source, "oenetacc");
    EXPECT_EQ(g_log[0].line, 42);
    EXPECT_EQ(g_log[0].function, "Fn");
    EXPECT_EQ(g_log[0].text, "value 5 of x");
}

TEST(Platform, ThreadIdsDifferAndPumpHookRuns) {
    unsigned long other = 0;
    std::thread t([&] { other = OEPlatform::CurrentThreadId(); });
    t.join();
    EXPECT_NE(other, 0u);
    EXPECT_NE(other, OEPlatform::CurrentThreadId());
    OEPlatform::SetPumpHook(&CountingPump, nullptr);
    EXPECT_EQ(OEPlatform::PumpMessages(), 0);
    EXPECT_EQ(OEPlatform::PumpMessages(), 1);
    OEPlatform::SetPumpHook(nullptr, nullptr);
    EXPECT_EQ(OEPlatform::PumpMessages(), 0);
}

TEST(Platform, FileWrappers) {
    std::string name = ::testing::TempDir() + "oesdk_platform_test.txt";
    std::FILE* f = _LDfopen(name.c_str(), "wb");
    ASSERT_NE(f, nullptr);
    std::fputs("12345", f);
    std::fclose(f);
    OEFileStat st{};
    ASSERT_EQ(_LD_stat(name.c_str(), &st), 0);
    EXPECT_EQ(st.size, 5);
    EXPECT_EQ(st.isDirectory, 0u);
    EXPECT_EQ(_LDunlink(name.c_str()), 0);
    EXPECT_EQ(_LD_stat(name.c_str(), &st), -1);
    EXPECT_EQ(_LDfopen(nullptr, "rb"), nullptr);
}

TEST(Platform, TimeFunctions) {
    std::tm tm{};
    ASSERT_EQ(OEPlatform::GmTime64(0, &tm), 1);
    EXPECT_EQ(tm.tm_year, 70);
    EXPECT_EQ(tm.tm_mday, 1);
    ASSERT_EQ(OEPlatform::GmTime64(951782400, &tm), 1); // 2000-02-29
    EXPECT_EQ(tm.tm_mon, 1);
    EXPECT_EQ(tm.tm_mday, 29);
    EXPECT_GT(OEPlatform::Time64(nullptr), 1700000000);
    std::tm local{};
    ASSERT_EQ(OEPlatform::LocalTime64(1700000000, &local), 1);
    local.tm_isdst = -1;
    EXPECT_EQ(OEPlatform::MkTime64(&local), 1700000000);
}
