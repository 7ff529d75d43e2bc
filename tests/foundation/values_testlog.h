// Test double: a parse log that records every warning of the test thread, installed for the
// lifetime of a ScopedWarningLog (the previous log is put back afterwards).
#ifndef OESDK_TESTS_VALUES_TESTLOG_H
#define OESDK_TESTS_VALUES_TESTLOG_H

#include "oesdk.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

struct RecordedWarning {
    OEParseWarning code;
    std::string text;
    std::string context;
};

class RecordingWarningLog : public OEParseWarningLog {
public:
    unsigned short AppendWarning(OEParseWarning code, const char* text, const char* auxText, OETagID,
                                 OEDataObj*) override {
        entries.push_back({code, text ? text : "", auxText ? auxText : ""});
        return 1;
    }
    std::vector<RecordedWarning> entries;
};

class ScopedWarningLog {
public:
    ScopedWarningLog() : m_log(new RecordingWarningLog), m_previous(OEThreadState::SetParseLog(m_log)) {}
    ~ScopedWarningLog() { delete OEThreadState::SetParseLog(m_previous); }
    ScopedWarningLog(const ScopedWarningLog&) = delete;
    ScopedWarningLog& operator=(const ScopedWarningLog&) = delete;

    std::vector<RecordedWarning>& Entries() { return m_log->entries; }
    void Clear() { m_log->entries.clear(); }
    // A gtest failure unless exactly one warning with this code and text (and context, when
    // given) was logged since the last Clear(); clears afterwards.
    ::testing::AssertionResult ExactlyOne(OEParseWarning code, const std::string& text,
                                          const char* context = nullptr) {
        std::vector<RecordedWarning> e = m_log->entries;
        Clear();
        if (e.size() != 1) return ::testing::AssertionFailure() << e.size() << " warnings logged";
        if (e[0].code != code) return ::testing::AssertionFailure() << "code " << e[0].code;
        if (e[0].text != text) return ::testing::AssertionFailure() << "text \"" << e[0].text << "\"";
        if (context && e[0].context != context)
            return ::testing::AssertionFailure() << "context \"" << e[0].context << "\"";
        return ::testing::AssertionSuccess();
    }
    ::testing::AssertionResult None() {
        const std::size_t n = m_log->entries.size();
        const std::string first = n ? m_log->entries[0].text + " / " + m_log->entries[0].context : "";
        Clear();
        if (n) return ::testing::AssertionFailure() << n << " warnings logged, first: " << first;
        return ::testing::AssertionSuccess();
    }

private:
    RecordingWarningLog* m_log;
    OEParseWarningLog* m_previous;
};

#endif
