// OEDataConversion, OEPayrollDataConversion, OEPayrollAmount and OELanguage: keyword tables,
// booleans, integers, identifiers, languages and the payroll text forms, each failure with
// exactly one logged warning.
#include "values_testlog.h"

#include <cctype>
#include <cstdint>
#include <string>

namespace {

class ValuesConversion : public ::testing::Test {
protected:
    ScopedWarningLog log;
};

// Every value of an enumeration prints as its keyword and reads back (ignoring case) as the first
// value with that keyword; values outside the enumeration print nothing; unknown text fails once.
template <class E>
void CheckEnum(ScopedWarningLog& log, const char* name, unsigned short (*toText)(E, OEString&),
               unsigned short (*fromText)(const char*, E&), int first, int last, const char* firstKeyword,
               const char* lastKeyword) {
    SCOPED_TRACE(name);
    OEString s;
    ASSERT_EQ(1, toText(static_cast<E>(first), s));
    EXPECT_STREQ(firstKeyword, s);
    ASSERT_EQ(1, toText(static_cast<E>(last), s));
    EXPECT_STREQ(lastKeyword, s);
    for (int v = first; v <= last; ++v) {
        ASSERT_EQ(1, toText(static_cast<E>(v), s));
        std::string lower = s.c_str();
        for (char& c : lower) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
        E back = static_cast<E>(last + 7);
        ASSERT_EQ(1, fromText(lower.c_str(), back)) << lower;
        ASSERT_LE(static_cast<int>(back), v);
        OEString again;
        toText(back, again);
        EXPECT_STREQ(s, again);
    }
    s = "untouched";
    EXPECT_EQ(0, toText(static_cast<E>(last + 1), s));
    if (first > 0) {
        EXPECT_EQ(0, toText(static_cast<E>(first - 1), s));
    }
    EXPECT_STREQ("untouched", s);
    E out = static_cast<E>(first);
    EXPECT_EQ(0, fromText("NOSUCHKEYWORD", out));
    EXPECT_EQ(first, static_cast<int>(out));
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "NOSUCHKEYWORD", ""));
    EXPECT_TRUE(log.None());
}

#define CHECK_ENUM(Cls, Stem, Type, First, Last, FirstKw, LastKw)                                            \
    CheckEnum<Type>(log, #Stem, &Cls::Stem##ToString, &Cls::StringTo##Stem, First, Last, FirstKw, LastKw)

TEST_F(ValuesConversion, EveryKeywordTable) {
    CHECK_ENUM(OEDataConversion, AssetClass, OEAssetClass, 0, 6, "DOMESTICBOND", "OTHER");
    CHECK_ENUM(OEDataConversion, BalType, OEBalType, 0, 2, "DOLLAR", "NUMBER");
    CHECK_ENUM(OEDataConversion, BankAccount, OEBankAccountType, 0, 5, "UNKNOWN", "CREDITLINE");
    CHECK_ENUM(OEDataConversion, BankAccount2, OEBankAccountType2, 0, 4, "CHECKING", "CMA");
    CHECK_ENUM(OEDataConversion, BankAction, OEBankAction, 0, 1, "REPLACE", "DELETE");
    CHECK_ENUM(OEDataConversion, BankTx, OEBankTxType, 0, 16, "CREDIT", "OTHER");
    CHECK_ENUM(OEDataConversion, BuyType, OEBuyType, 0, 1, "BUY", "BUYTOCOVER");
    CHECK_ENUM(OEDataConversion, CallType, OECallType, 0, 3, "CALL", "MATURITY");
    CHECK_ENUM(OEDataConversion, CharacterType, OECharacterType, 0, 3, "ALPHAONLY", "ALPHAANDNUMERIC");
    CHECK_ENUM(OEDataConversion, ClientRouting, OEClientRouting, 0, 2, "NONE", "MSGSET");
    CHECK_ENUM(OEDataConversion, CouponFreq, OECouponFreq, 0, 4, "MONTHLY", "OTHER");
    CHECK_ENUM(OEDataConversion, DayOfWeek, OEDayOfWeek, 0, 6, "MONDAY", "SUNDAY");
    CHECK_ENUM(OEDataConversion, DebtAction, OEDebtAction, 0, 1, "CALLED", "MATURED");
    CHECK_ENUM(OEDataConversion, DebtClass, OEDebtClass, 0, 3, "TREASURY", "OTHER");
    CHECK_ENUM(OEDataConversion, DebtType, OEDebtType, 0, 1, "COUPON", "ZERO");
    CHECK_ENUM(OEDataConversion, Duration, OEDuration, 0, 2, "DAY", "IMMEDIATE");
    CHECK_ENUM(OEDataConversion, ExtdPmtFor, OEExtdPmtFor, 0, 1, "INDIVIDUAL", "BUSINESS");
    CHECK_ENUM(OEDataConversion, FidelityOptBuyType, OEFidelityOptBuyType, 0, 0, "BUY", "BUY");
    CHECK_ENUM(OEDataConversion, FidelityOptSellType, OEFidelityOptSellType, 0, 0, "SELL", "SELL");
    CHECK_ENUM(OEDataConversion, Frequency, OEFrequency, 0, 8, "WEEKLY", "ANNUALLY");
    CHECK_ENUM(OEDataConversion, HeaderTag, OEHeaderTag, 2, 10, "OFXHEADER", "NEWFILEUID");
    CHECK_ENUM(OEDataConversion, IncomeType, OEIncomeType, 0, 4, "CGLONG", "MISC");
    CHECK_ENUM(OEDataConversion, InvAcctType, OEInvAcctType, 0, 3, "INDIVIDUAL", "CORPORATE");
    CHECK_ENUM(OEDataConversion, MFType, OEMFType, 0, 2, "OPENEND", "OTHER");
    CHECK_ENUM(OEDataConversion, OFXCharSet, OEOFXCharSet, 0, 0, "1252", "1252");
    CHECK_ENUM(OEDataConversion, OFXCompression, OEOFXCompression, 0, 0, "NONE", "NONE");
    CHECK_ENUM(OEDataConversion, OFXData, OEOFXData, 0, 0, "OFXSGML", "OFXSGML");
    CHECK_ENUM(OEDataConversion, OFXEncoding, OEOFXEncoding, 0, 1, "USASCII", "UTF-8");
    CHECK_ENUM(OEDataConversion, OFXFileUID, OEOFXFileUID, 0, 0, "NONE", "NONE");
    CHECK_ENUM(OEDataConversion, OFXSecurity, OEOFXSecurity, 0, 1, "NONE", "TYPE1");
    CHECK_ENUM(OEDataConversion, OptAction, OEOptAction, 0, 2, "EXERCISE", "EXPIRE");
    CHECK_ENUM(OEDataConversion, OptBuyType, OEOptBuyType, 0, 1, "BUYTOOPEN", "BUYTOCLOSE");
    CHECK_ENUM(OEDataConversion, OptSellType, OEOptSellType, 0, 1, "SELLTOOPEN", "SELLTOCLOSE");
    CHECK_ENUM(OEDataConversion, OptType, OEOptType, 0, 2, "PUT", "OTHER");
    CHECK_ENUM(OEDataConversion, PayeeIDScope, OEPayeeIDScope, 0, 1, "GLOBAL", "USER");
    CHECK_ENUM(OEDataConversion, PosType, OEPosType, 0, 1, "LONG", "SHORT");
    CHECK_ENUM(OEDataConversion, ProcCode, OEProcCode, 0, 5, "WILLPROCESSON", "CANCELEDON");
    CHECK_ENUM(OEDataConversion, RelType, OERelType, 0, 3, "SPREAD", "OTHER");
    CHECK_ENUM(OEDataConversion, Restriction, OERestriction, 0, 2, "ALLORNONE", "NONE");
    CHECK_ENUM(OEDataConversion, Secured, OESecured, 0, 1, "NAKED", "COVERED");
    CHECK_ENUM(OEDataConversion, SellReason, OESellReason, 0, 2, "CALL", "MATURITY");
    CHECK_ENUM(OEDataConversion, SellType, OESellType, 0, 1, "SELL", "SELLSHORT");
    CHECK_ENUM(OEDataConversion, Service, OEService, 0, 2, "BANKSVC", "INVSVC");
    CHECK_ENUM(OEDataConversion, Service2, OEService2, 0, 3, "BANKSVC", "PRESSVC");
    CHECK_ENUM(OEDataConversion, ServiceStatus, OEServiceStatus, 0, 2, "AVAIL", "ACTIVE");
    CHECK_ENUM(OEDataConversion, ServiceStatus2, OEServiceStatus2, 0, 3, "AVAIL", "REJECTED");
    CHECK_ENUM(OEDataConversion, StatusSeverity, OEStatusSeverity, 0, 2, "INFO", "ERROR");
    CHECK_ENUM(OEDataConversion, StockType, OEStockType, 0, 3, "COMMON", "OTHER");
    CHECK_ENUM(OEDataConversion, SubAcct, OESubAcct, 0, 3, "CASH", "OTHER");
    CHECK_ENUM(OEDataConversion, SyncMode, OESyncMode, 0, 1, "FULL", "LITE");
    CHECK_ENUM(OEDataConversion, TferAction, OETferAction, 0, 1, "IN", "OUT");
    CHECK_ENUM(OEDataConversion, USProductType, OEUSProductType, 0, 10, "401K", "UGMA");
    CHECK_ENUM(OEDataConversion, UnitType, OEUnitType, 0, 1, "SHARES", "CURRENCY");
    CHECK_ENUM(OEPayrollDataConversion, AccrualPeriod, OEAccrualPeriod, 0, 2, "YEARLY", "HOURLY");
    CHECK_ENUM(OEPayrollDataConversion, BenefitType, OEBenefitType, 0, 0, "BENEFITNONE", "BENEFITNONE");
    CHECK_ENUM(OEPayrollDataConversion, CalculationType, OECalculationType, 0, 5, "FLATRATE", "TAXTABLE");
    CHECK_ENUM(OEPayrollDataConversion, DirectDepositMode, OEDirectDepositMode, 0, 5, "NO",
               "PENDING_ENROLLMENT");
    CHECK_ENUM(OEPayrollDataConversion, EmpSeasonalType, OESeasonalType, 0, 2, "UNKNOWN", "NONSEASONAL");
    CHECK_ENUM(OEPayrollDataConversion, EmployeeGender, OEEmployeeGender, 0, 2, "UNKNOWN", "MALE");
    CHECK_ENUM(OEPayrollDataConversion, EmployeeType, OEEmployeeType, 0, 4, "REG", "REP");
    CHECK_ENUM(OEPayrollDataConversion, FederalFilingStatus, OEFederalFilingStatus, 0, 3, "SINGLE",
               "HEADOFHOUSE_W42020");
    CHECK_ENUM(OEPayrollDataConversion, FederalTax, OEFederalTax, 0, 10, "FIT", "MED_EE_TIPS");
    CHECK_ENUM(OEPayrollDataConversion, FederalTaxPaymentFrequency, OEFederalTaxPaymentFrequency, 0, 3,
               "QTRLY", "DAILY");
    CHECK_ENUM(OEPayrollDataConversion, FederalW4FilingYear, OEFederalW4FilingYear, 0, 2, "", "2020ANDLATER");
    CHECK_ENUM(OEPayrollDataConversion, HealthCareLevel, OEHealthCareLevel, 0, 2, "EMPLOYEE", "DEPENDENTS");
    CHECK_ENUM(OEPayrollDataConversion, HealthCareProvider, OEHealthCareProvider, 0, 1, "EMPLOYEE",
               "COMPANY");
    CHECK_ENUM(OEPayrollDataConversion, PayCheckType, OEPayCheckType, 0, 1, "PAYCHK", "YTDADJ");
    CHECK_ENUM(OEPayrollDataConversion, PayType, OEPayType, 0, 2, "REG", "VAC");
    CHECK_ENUM(OEPayrollDataConversion, PayrollFrequency, OEPayrollFrequency, 0, 6, "DAILY", "YEARLY");
    CHECK_ENUM(OEPayrollDataConversion, PayrollItemSpecialType, OEPayrollItemSpecialType, 0, 13, "COMCARE",
               "WORKER_COMP");
    CHECK_ENUM(OEPayrollDataConversion, PayrollTestingType, OEPayrollTestingType, 0, 2, "ACH", "Y");
    CHECK_ENUM(OEPayrollDataConversion, PayrollTxType, OEPayrollTxType, 0, 7, "CARRYOVER", "FUNDSTRANSFER");
    CHECK_ENUM(OEPayrollDataConversion, PayrollType, OEPayrollType, 0, 3, "REG", "HOUSEHOLD");
    CHECK_ENUM(OEPayrollDataConversion, StateTax, OEStateTax, 0, 4, "SIT", "SDI_EE");
    CHECK_ENUM(OEPayrollDataConversion, TaxFormLine, OETaxFormLine, 0, 72, "NONE", "TTT46");
    CHECK_ENUM(OEPayrollDataConversion, TaxPaymentType, OETaxPaymentType, 0, 1, "LIAB", "PMT");
    CHECK_ENUM(OEPayrollDataConversion, TaxServiceMode, OETaxServiceMode, 0, 5, "NO", "NO");
}

TEST_F(ValuesConversion, KeywordDetails) {
    OEString s;
    struct Case {
        const char* text;
        int value; // -1: refused
    } bank[] = {{"Checking", 1}, {"CHECKINGS", -1}, {"", -1}, {"CHECK", -1}};
    for (const Case& c : bank) {
        OEBankAccountType t = OEBAT_CREDIT;
        EXPECT_EQ(c.value >= 0, OEDataConversion::StringToBankAccount(c.text, t) == 1) << c.text;
        if (c.value >= 0) {
            EXPECT_EQ(c.value, t);
        } else {
            EXPECT_EQ(OEBAT_CREDIT, t);
            EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, c.text, ""));
        }
    }
    // Header names: 0 and 1 are never matched, "OFXHEADER" is 2.
    OEHeaderTag h = OEHT_CONTENTTYPE;
    EXPECT_EQ(1, OEDataConversion::StringToHeaderTag("ofxheader", h));
    EXPECT_EQ(OEHT_OFXHEADER, h);
    EXPECT_EQ(0, OEDataConversion::StringToHeaderTag("CONTENT-TYPE", h));
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "CONTENT-TYPE"));
    EXPECT_EQ(0, OEDataConversion::StringToHeaderTag("", h));
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, ""));
    // "NO" is value 0 of the tax service mode; value 5 prints as NO too.
    OETaxServiceMode m = OETSM_ACTIVE;
    EXPECT_EQ(1, OEPayrollDataConversion::StringToTaxServiceMode("NO", m));
    EXPECT_EQ(OETSM_NO, m);
    EXPECT_EQ(1, OEPayrollDataConversion::TaxServiceModeToString(OETSM_NO2, s));
    EXPECT_STREQ("NO", s);
    // The empty text is value 0 of the W-4 filing year.
    OEFederalW4FilingYear y = OEFW4_2020ANDLATER;
    EXPECT_EQ(1, OEPayrollDataConversion::StringToFederalW4FilingYear("", y));
    EXPECT_EQ(OEFW4_NONE, y);
    // Tax form lines: the named ones and the reserved TTT7 .. TTT46.
    struct Line {
        OETaxFormLine value;
        const char* keyword;
    } lines[] = {{OETFL_401K, "401K"}, {OETFL_TTT1, "TTT1"}, {static_cast<OETaxFormLine>(33), "TTT7"}};
    for (const Line& l : lines) {
        EXPECT_EQ(1, OEPayrollDataConversion::TaxFormLineToString(l.value, s));
        EXPECT_STREQ(l.keyword, s);
    }
    OEGLMode g = OEGLM_ACTIVE;
    EXPECT_EQ(1, OEPayrollDataConversion::StringToGuidelineMode("pending_setup", g));
    EXPECT_EQ(OEGLM_PENDING_SETUP, g);
    EXPECT_TRUE(log.None());
}

TEST_F(ValuesConversion, GenericEnumFunctions) {
    static const char* const kTable[] = {"ZERO", "ONE", "TWO", "one"};
    OEString s("keep");
    EXPECT_EQ(1, OEDataConversion::EnumToString(2, s, 1, 3, kTable));
    EXPECT_STREQ("TWO", s);
    EXPECT_EQ(0, OEDataConversion::EnumToString(4, s, 1, 3, kTable));
    EXPECT_STREQ("", s); // emptied
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "4"));
    EXPECT_EQ(0, OEDataConversion::EnumToString(0, s, 1, 3, kTable));
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "0"));
    unsigned short v = 99;
    EXPECT_EQ(1, OEDataConversion::StringToEnum("One", v, 1, 3, kTable));
    EXPECT_EQ(1, v); // the first match
    EXPECT_EQ(0, OEDataConversion::StringToEnum("zero", v, 1, 3, kTable));
    EXPECT_EQ(1, v);
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "zero"));
    EXPECT_EQ(0, OEDataConversion::StringToEnum(nullptr, v, 1, 3, kTable));
    EXPECT_TRUE(log.ExactlyOne(OEPW_NULLPOINTER, ""));
}

TEST_F(ValuesConversion, Booleans) {
    struct Case {
        const char* text;
        int value;
    } cases[] = {{"Y", 1}, {"N", 0}, {"y", -1}, {"n", -1}, {"YES", -1}, {"", -1}, {" Y", -1}};
    for (const Case& c : cases) {
        unsigned short v = 7;
        EXPECT_EQ(c.value >= 0, OEDataConversion::StringToBoolean(c.text, v) == 1) << c.text;
        if (c.value >= 0) {
            EXPECT_EQ(c.value, v);
        } else {
            EXPECT_EQ(7, v);
            EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, c.text, ""));
        }
    }
    OEString s("keep");
    EXPECT_EQ(1, OEDataConversion::BooleanToString(1, s));
    EXPECT_STREQ("Y", s);
    EXPECT_EQ(1, OEDataConversion::BooleanToString(0, s));
    EXPECT_STREQ("N", s);
    EXPECT_EQ(0, OEDataConversion::BooleanToString(2, s));
    EXPECT_STREQ("N", s);
}

TEST_F(ValuesConversion, Integers) {
    enum Kind { S16, U16, S32, U32 };
    struct Case {
        Kind kind;
        const char* text;
        long long value;
        int warning; // -1: converts
    } cases[] = {{S16, "32767", 32767, -1},
                 {S16, "32768", 0, OEPW_OUTOFRANGE},
                 {S16, "-32768", -32768, -1},
                 {S16, "-32769", 0, OEPW_OUTOFRANGE},
                 {S16, "-1,234", -1234, -1},
                 {S16, "1.0", 1, -1},
                 {S16, "1.5", 0, OEPW_BADFORMAT},
                 {S16, "abc", 0, OEPW_BADFORMAT},
                 {S16, "", 0, OEPW_BADFORMAT},
                 {U16, "65535", 65535, -1},
                 {U16, "65536", 0, OEPW_OUTOFRANGE},
                 {U16, "-5", 5, -1}, // the sign is not looked at
                 {S32, "2147483647", 2147483647, -1},
                 {S32, "-2147483648", -2147483648LL, -1},
                 {S32, "2147483648", 0, OEPW_OUTOFRANGE},
                 {S32, "-2147483649", 0, OEPW_OUTOFRANGE},
                 {U32, "4294967295", 4294967295LL, -1},
                 {U32, "4294967296", 0, OEPW_OUTOFRANGE},
                 {U32, "1,000,000.000", 1000000, -1},
                 {U32, "99999999999999999999999999999", 0, OEPW_TOOLONG}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        std::int16_t s16 = 42;
        std::uint16_t u16 = 42;
        std::int32_t s32 = 42;
        std::uint32_t u32 = 42;
        unsigned short ok = 0;
        long long got = 0;
        switch (c.kind) {
        case S16:
            ok = OEDataConversion::StringToSShort(c.text, s16), got = s16;
            break;
        case U16:
            ok = OEDataConversion::StringToUShort(c.text, u16), got = u16;
            break;
        case S32:
            ok = OEDataConversion::StringToSLong(c.text, s32), got = s32;
            break;
        case U32:
            ok = OEDataConversion::StringToULong(c.text, u32), got = u32;
            break;
        }
        EXPECT_EQ(c.warning < 0, ok == 1);
        EXPECT_EQ(c.warning < 0 ? c.value : 42, got); // untouched on failure
        if (c.warning < 0) {
            EXPECT_TRUE(log.None());
        } else {
            EXPECT_TRUE(log.ExactlyOne(static_cast<OEParseWarning>(c.warning), c.text, ""));
        }
    }
}

TEST_F(ValuesConversion, RatesIdentifiersLanguagesDates) {
    OEPercent rate;
    EXPECT_EQ(1, OEDataConversion::StringToRate("150.5", rate)); // range not checked here
    EXPECT_FALSE(rate.IsValid());
    EXPECT_EQ(0, OEDataConversion::StringToRate("12%", rate));
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "12%"));
    EXPECT_STREQ("150.5", static_cast<char*>(rate));

    OEString12 payee("OLD");
    OEString s;
    EXPECT_EQ(3, OEDataConversion::StringToPayeeID("", payee));
    EXPECT_STREQ("OLD", payee);
    EXPECT_EQ(1, OEDataConversion::StringToPayeeID("123456789012", payee));
    EXPECT_EQ(0, OEDataConversion::StringToPayeeID("1234567890123", payee));
    EXPECT_TRUE(log.ExactlyOne(OEPW_TOOLONG, "1234567890123", ""));
    EXPECT_STREQ("1234567890123", payee); // kept whole
    EXPECT_EQ(1, OEDataConversion::PayeeIDToString(payee, s));
    EXPECT_STREQ("1234567890123", s);

    struct Lang {
        const char* text;
        bool valid;
    } langs[] = {{"ENG", true}, {"fra", true}, {"EN", false}, {"ENGL", false}, {"EN1", false}, {"", false}};
    for (const Lang& l : langs) {
        OELanguage lang;
        EXPECT_EQ(l.valid, OEDataConversion::StringToLanguage(l.text, lang) == 1) << l.text;
        if (!l.valid) {
            EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, l.text, ""));
        }
        EXPECT_STREQ(l.text, lang);
        EXPECT_EQ(1, OEDataConversion::LanguageToString(lang, s));
        EXPECT_STREQ(l.text, s);
    }

    OEDateTime d("20240131");
    EXPECT_EQ(0, OEDataConversion::StringToDateTime("20230229", d));
    EXPECT_TRUE(log.ExactlyOne(OEPW_OUTOFRANGE, "20230229"));
    EXPECT_EQ(1, OEDataConversion::DateTimeToString(d, s)); // unchanged by the failure
    EXPECT_STREQ("20240131", s);
    EXPECT_EQ(1, OEDataConversion::StringToDateTime("20240131120000.5[-5:EST]", d));
    EXPECT_EQ(1, OEDataConversion::DateTimeToString(d, s));
    EXPECT_STREQ("20240131120000.005[-5:EST]", s);
    OETime t;
    EXPECT_EQ(1, OEDataConversion::StringToTime("120000.5[-5:EST]", t));
    EXPECT_EQ(1, OEDataConversion::TimeToString(t, s));
    EXPECT_STREQ("120000.5[-5:EST]", s);
    EXPECT_EQ(0, OEDataConversion::StringToTime("12:00", t));
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "12:00"));

    OEPayrollDateTime p("20240131");
    EXPECT_EQ(1, OEPayrollDataConversion::StringToPayrollDateTime("__OFX_EMPTY_STRING__", p));
    EXPECT_EQ(1, OEPayrollDataConversion::PayrollDateTimeToString(p, s));
    EXPECT_STREQ("^@~*", s);
    EXPECT_EQ(0, OEPayrollDataConversion::StringToPayrollDateTime("2024", p));
    EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, "2024"));
    EXPECT_EQ(1, p.IsEmpty()); // unchanged by the failure
    EXPECT_TRUE(log.None());
}

std::string PayrollText(const OEPayrollAmount& a) {
    OEString s("<failed>");
    OEPayrollDataConversion::PayrollAmountToString(a, s);
    return s.c_str();
}

TEST_F(ValuesConversion, PayrollAmountTextForm) {
    const std::string max = "79228162514264337593543950335";
    struct Case {
        const char* number;
        unsigned short percent, money, dollar, empty;
        const char* form;
    } cases[] = {{"5", 0, 1, 0, 0, "5.00"},
                 {"5.5", 0, 1, 0, 0, "5.50"},
                 {"5.25", 0, 1, 0, 0, "5.25"},
                 {"1.234", 0, 1, 0, 0, "1.234"},
                 {"-.5", 0, 1, 0, 0, "-0.50"},
                 {"5", 0, 1, 1, 0, "$5.00"},
                 {"-5.1", 0, 1, 1, 0, "-$5.10"},
                 {"12.5", 1, 0, 0, 0, "12.5%"},
                 {".5", 0, 0, 0, 0, "0.5"},
                 {"2.00", 0, 0, 0, 0, "2"},
                 {"-0", 0, 0, 0, 0, "-0"},
                 {"7", 0, 1, 0, 1, "^@~*"},
                 {".0000000000000000000000000001", 1, 0, 0, 0, ".0000000000000000000000000001%"},
                 {".0000000000000000000000000001", 0, 0, 0, 0, "0.0000000000000000000000000001"},
                 {"9999999999999999999999999999", 0, 1, 0, 0, "9999999999999999999999999999"},
                 {"999999999999999999999999999", 0, 1, 0, 0, "999999999999999999999999999.00"},
                 {"99999999999999999999999999.9", 0, 1, 0, 0, "99999999999999999999999999.90"},
                 {"9999999999999999999999999999", 0, 1, 1, 0, "$9999999999999999999999999999"},
                 {"-9999999999999999999999999999", 0, 1, 1, 0, ""},
                 {"-999999999999999999999999999.9", 1, 0, 0, 0, ""}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.number);
        OEPayrollAmount a(OEPrecisionInteger(c.number), c.percent, c.money);
        a.SetDollarSign(c.dollar);
        a.SetEmpty(c.empty);
        EXPECT_EQ(c.form, PayrollText(a));
    }
    EXPECT_EQ("^@~*", PayrollText(OEPayrollAmount(OEPAT_EMPTY)));
    EXPECT_EQ("0.00", PayrollText(OEPayrollAmount(OEPAT_MONEY)));
    EXPECT_EQ("-123.45%", PayrollText(OEPayrollAmount(-12345LL, 2, 1)));
    // The full 96-bit magnitude as a percentage (29 digits + '%').
    OEPrecisionInteger big;
    big.ImportBinary(std::vector<unsigned char>{1,    0,    0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF,
                                                0xFF, 0xFF, 0xFF, 0xFF, 1,    0,    0,    0,    0,    0}
                         .data());
    EXPECT_EQ(max + "%", PayrollText(OEPayrollAmount(big, 1, 0)));
    EXPECT_TRUE(log.None());
}

TEST_F(ValuesConversion, PayrollAmountParseAndEquality) {
    struct Case {
        const char* text;
        unsigned short ok, empty, percent, money;
        const char* number;
    } cases[] = {{"^@~*", 1, 1, 0, 0, nullptr}, {"__OFX_EMPTY_STRING__", 1, 1, 0, 0, nullptr},
                 {"12.50", 1, 0, 0, 0, "12.5"}, {"$1,234.50", 1, 0, 0, 1, "1234.5"},
                 {"-$3", 1, 0, 0, 1, "-3"},     {"12.5%", 1, 0, 1, 0, "12.5"},
                 {"5$", 0, 0, 0, 0, nullptr},   {"%", 0, 0, 0, 0, nullptr},
                 {"$$5", 0, 0, 0, 0, nullptr}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        OEPayrollAmount a;
        EXPECT_EQ(c.ok, OEPayrollDataConversion::StringToPayrollAmount(c.text, a));
        if (!c.ok) {
            EXPECT_TRUE(log.ExactlyOne(OEPW_BADFORMAT, c.text, "")); // the text as written
            continue;
        }
        EXPECT_EQ(c.empty, a.IsEmpty());
        EXPECT_EQ(c.percent, a.IsPercent());
        EXPECT_EQ(c.money, a.IsMoney());
        if (c.number) {
            EXPECT_TRUE(OEPrecisionInteger(c.number) == OEPrecisionInteger(a));
        }
    }
    OEPayrollAmount money(OEPrecisionInteger("5"), 0, 1), money2(OEPrecisionInteger("5.00"), 0, 1);
    OEPayrollAmount plain(OEPrecisionInteger("5"), 0, 0), empty(OEPAT_EMPTY);
    EXPECT_TRUE(money == money2);
    EXPECT_FALSE(money == plain);
    EXPECT_TRUE(money != plain);
    EXPECT_FALSE(empty == OEPayrollAmount(OEPAT_EMPTY));
    EXPECT_TRUE(plain == OEPrecisionInteger("5"));
    EXPECT_FALSE(money == OEPrecisionInteger("5"));
    EXPECT_TRUE(log.None());
}

} // namespace
