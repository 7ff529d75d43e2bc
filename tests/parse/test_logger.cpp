// The per-thread log, the exception record and the entity tables.
#include "oesdk.h"

#include <gtest/gtest.h>

#include <string>

// The names themselves are read in every parser test's log lines; a code past the table has the
// first name.
TEST(ParseException, WarningNameOfAnUnknownCode) {
    EXPECT_STREQ(OEParseException::WarningString(static_cast<OEParseWarning>(99)), "OEPW_UNKNOWNEXCEPTION");
}

TEST(ParseLogger, FlagsCopiesAndOwnership) {
    OEParseLogger* log = OEParseLogger::TheOEParseLogger();
    ASSERT_NE(log, nullptr);
    log->DeleteAll();
    EXPECT_EQ(log->GetAnyParseExceptionsLogged(), 0);

    log->EnableLogging(0);
    EXPECT_EQ(log->AppendParseException(OEPW_TOOLONG, OEString("t"), OEString(), OETAG_NAME, nullptr), 1);
    EXPECT_EQ(log->GetNumberParseExceptions(), 0);
    EXPECT_EQ(log->GetAnyParseExceptionsLogged(), 1); // set even while disabled
    log->EnableLogging(1);

    OEDataObj object(1);
    EXPECT_EQ(log->AppendParseException(OEPW_BADFORMAT, OEString("DTASOF"), OEString("2024xx"), OETAG_DTASOF,
                                        &object),
              1);
    EXPECT_EQ(OELogParseWarning(OEPW_OUTOFRANGE, "x"), 1);
    ASSERT_EQ(log->GetNumberParseExceptions(), 2);
    const OEParseException* e = log->GetParseException(0);
    EXPECT_EQ(e->GetCode(), OEPW_BADFORMAT);
    EXPECT_STREQ(e->GetAuxText(), "2024xx");
    EXPECT_EQ(e->GetObject(), &object);
    EXPECT_EQ(log->GetParseException(5), nullptr);

    OEParseLogger copy, other;
    other.AppendParseException(OEPW_LOWERCASE, OEString("memo"), OEString(), OETAG_MEMO, nullptr);
    EXPECT_EQ(log->CopyExceptionListTo(&other), 1); // appended after what was there
    ASSERT_EQ(other.GetNumberParseExceptions(), 3);
    EXPECT_EQ(other.GetParseException(1)->GetCode(), OEPW_BADFORMAT);
    EXPECT_NE(other.GetParseException(1), log->GetParseException(0)); // copies, not shared
    EXPECT_EQ(copy.DeepCopyFrom(&other), 1);
    EXPECT_EQ(copy.GetNumberParseExceptions(), 3);
    copy.DeleteAll();
    EXPECT_EQ(copy.GetNumberParseExceptions(), 0);
    EXPECT_EQ(copy.GetAnyParseExceptionsLogged(), 0);
    EXPECT_EQ(other.GetNumberParseExceptions(), 3);
    log->DeleteAll();
}

TEST(Utility, EntityTables) {
    struct Case {
        const char* name;
        char plain;
        char quoted;
    } cases[] = {{"nbsp", ' ', ' '}, {"GT", '>', '>'},  {"lt", '<', '<'}, {"Amp", '&', '&'},
                 {"quot", 0, '"'},   {"apos", 0, '\''}, {"bogus", 0, 0},  {"", 0, 0}};
    for (const auto& c : cases) {
        const unsigned short n = static_cast<unsigned short>(std::string(c.name).size());
        OEUtility::SetXmlQuoteMacros(0);
        EXPECT_EQ(OEUtility::GetMacroChar(c.name, n), c.plain) << c.name;
        OEUtility::SetXmlQuoteMacros(1);
        EXPECT_EQ(OEUtility::GetMacroChar(c.name, n), c.quoted) << c.name;
    }
    OEUtility::SetXmlQuoteMacros(0);
    EXPECT_EQ(OEUtility::ContainsMacro("a \"b\" c"), 0);
    EXPECT_EQ(OEUtility::ContainsMacro("a<b"), 1);
    EXPECT_EQ(OEUtility::GetMacroString(' '), nullptr); // a space is never written as an entity
    EXPECT_STREQ(OEUtility::GetMacroString('&'), "amp");
    EXPECT_EQ(OEUtility::GetMacroString('\''), nullptr);
    OEUtility::SetXmlQuoteMacros(1);
    EXPECT_EQ(OEUtility::ContainsMacro("it's"), 1);
    EXPECT_STREQ(OEUtility::GetMacroString('\''), "apos");
    OEUtility::SetXmlQuoteMacros(0);
}
