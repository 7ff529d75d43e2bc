#include "alloc_failure.h"
#include "oesdk.h"

#include <gtest/gtest.h>

#include <thread>

TEST(ThreadState, AttachTwiceKeepsOneRecord) {
    unsigned long id = 0x7FFF0001ul;
    unsigned short before = OEThreadState::NumberOfThreads();
    EXPECT_EQ(OEAttachThread(id), 1);
    EXPECT_EQ(OEAttachThread(id), 1);
    EXPECT_EQ(OEThreadState::NumberOfThreads(), before + 1);
    EXPECT_EQ(OEDetachThread(id), 1);
    EXPECT_EQ(OEThreadState::NumberOfThreads(), before);
    EXPECT_EQ(OEDetachThread(id), 1); // no record: still 1
    EXPECT_EQ(OEThreadState::Find(id), nullptr);
}

TEST(ThreadState, UnattachedThreadReadsOutOfMemory) {
    unsigned long workerId = 0, code = 0, platformId = 0;
    std::thread worker([&] {
        platformId = OEPlatform::CurrentThreadId();
        code = OEThreadState::GetErrorCode();
        OEThreadState::SetErrorCode(0); // no record: nothing happens
        workerId = OEThreadState::GetErrorCode();
    });
    worker.join();
    EXPECT_EQ(code, 1u);
    EXPECT_EQ(workerId, 1u);
    EXPECT_NE(platformId, OEPlatform::CurrentThreadId());
}

TEST(ThreadState, ErrorCodesArePerThread) {
    OEThreadState::SetErrorCode(0);
    unsigned long seen = 99;
    std::thread worker([&] {
        unsigned long me = OEPlatform::CurrentThreadId();
        OEAttachThread(me);
        OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        seen = OEThreadState::GetErrorCode();
        OEDetachThread(me);
    });
    worker.join();
    EXPECT_EQ(seen, 1u);
    EXPECT_EQ(OEThreadState::GetErrorCode(), 0u);
}

namespace {
class RecordingLog : public OEParseWarningLog {
public:
    static int destroyed;
    ~RecordingLog() override { ++destroyed; }
    unsigned short AppendWarning(OEParseWarning code, const char* text, const char*, OETagID tag,
                                 OEDataObj*) override {
        lastCode = code;
        lastText = text ? text : "";
        lastTag = tag;
        return 1;
    }
    OEParseWarning lastCode = OEPW_UNKNOWNEXCEPTION;
    std::string lastText;
    OETagID lastTag = OETAG_NONE;
};
int RecordingLog::destroyed = 0;
} // namespace

TEST(ThreadState, RecordOwnsItsParseLog) {
    unsigned short logged = 0;
    std::string text;
    std::thread worker([&] {
        unsigned long me = OEPlatform::CurrentThreadId();
        EXPECT_EQ(OELogParseWarning(OEPW_BADFORMAT, "x"), 0); // not attached: nowhere to log
        OEAttachThread(me);
        auto* log = new RecordingLog;
        delete OEThreadState::SetParseLog(log);
        logged = OELogParseWarning(OEPW_BADFORMAT, "12x4", nullptr, OETAG_TRNAMT);
        text = log->lastText;
        OEDetachThread(me); // destroys the log
    });
    worker.join();
    EXPECT_EQ(logged, 1);
    EXPECT_EQ(text, "12x4");
    EXPECT_EQ(RecordingLog::destroyed, 1);
}

TEST(ThreadState, AttachFailsWhenMemoryIsShort) {
    FailAllocations fail;
    EXPECT_EQ(OEAttachThread(0x7FFF0002ul), 0);
    EXPECT_EQ(OEThreadState::Find(0x7FFF0002ul), nullptr);
}
