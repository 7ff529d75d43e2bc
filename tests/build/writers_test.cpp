// The builder's value and element writers: the text of every enumeration writer, refusals, the
// two element forms, which writers go through AddString, and that each element writer calls its
// value writer through the table (a subclass that replaces one writer changes only its piece).
#include "build_helpers.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>

namespace {

using namespace buildtest;

// One enumeration value writer, called with an int cast to its enumeration. `good` is the
// enumeration's last value, so good + 1 is the first value without a keyword.
struct ValueRow {
    const char* name;
    std::function<int(OEBuilder&, int)> write;
    int good;
    const char* keyword;
    bool viaString; // written through AddString(keyword, 0, 1) rather than appended directly
};

#define VALUE_ROW(W, T, good, kw, viaString)                                                                 \
    {                                                                                                        \
#W, [](OEBuilder & b, int v) { return b.W(static_cast<T>(v)); }, good, kw, viaString                 \
    }

const ValueRow kValueRows[] = {
    VALUE_ROW(AddBankTxType, OEBankTxType, 16, "OTHER", false),
    VALUE_ROW(AddBankAction, OEBankAction, 1, "DELETE", false),
    VALUE_ROW(AddProcCode, OEProcCode, 5, "CANCELEDON", false),
    VALUE_ROW(AddDayOfWeek, OEDayOfWeek, 6, "SUNDAY", false),
    VALUE_ROW(AddClientRouting, OEClientRouting, 2, "MSGSET", false),
    VALUE_ROW(AddOFXSecurity, OEOFXSecurity, 1, "TYPE1", false),
    VALUE_ROW(AddSyncMode, OESyncMode, 1, "LITE", false),
    VALUE_ROW(AddCharacterType, OECharacterType, 3, "ALPHAANDNUMERIC", true),
    VALUE_ROW(AddBankAccountType, OEBankAccountType, 5, "CREDITLINE", false),
    VALUE_ROW(AddService, OEService, 2, "INVSVC", false),
    VALUE_ROW(AddService2, OEService2, 3, "PRESSVC", false),
    VALUE_ROW(AddServiceStatus, OEServiceStatus, 2, "ACTIVE", false),
    VALUE_ROW(AddServiceStatus2, OEServiceStatus2, 3, "REJECTED", false),
    VALUE_ROW(AddBuyType, OEBuyType, 1, "BUYTOCOVER", true),
    VALUE_ROW(AddCallType, OECallType, 3, "MATURITY", true),
    VALUE_ROW(AddDuration, OEDuration, 2, "IMMEDIATE", true),
    VALUE_ROW(AddDebtClass, OEDebtClass, 3, "OTHER", true),
    VALUE_ROW(AddDebtType, OEDebtType, 1, "ZERO", true),
    VALUE_ROW(AddIncomeType, OEIncomeType, 4, "MISC", true),
    VALUE_ROW(AddInvAcctType, OEInvAcctType, 3, "CORPORATE", true),
    VALUE_ROW(AddMFType, OEMFType, 2, "OTHER", true),
    VALUE_ROW(AddOptAction, OEOptAction, 2, "EXPIRE", true),
    VALUE_ROW(AddOptBuyType, OEOptBuyType, 1, "BUYTOCLOSE", true),
    VALUE_ROW(AddFidelityOptBuyType, OEFidelityOptBuyType, 0, "BUY", true),
    VALUE_ROW(AddSellReason, OESellReason, 2, "MATURITY", true),
    VALUE_ROW(AddOptSellType, OEOptSellType, 1, "SELLTOCLOSE", true),
    VALUE_ROW(AddFidelityOptSellType, OEFidelityOptSellType, 0, "SELL", true),
    VALUE_ROW(AddOptType, OEOptType, 2, "OTHER", true),
    VALUE_ROW(AddPosType, OEPosType, 1, "SHORT", true),
    VALUE_ROW(AddRelType, OERelType, 3, "OTHER", true),
    VALUE_ROW(AddRestriction, OERestriction, 2, "NONE", true),
    VALUE_ROW(AddSecured, OESecured, 1, "COVERED", true),
    VALUE_ROW(AddSellType, OESellType, 1, "SELLSHORT", true),
    VALUE_ROW(AddStockType, OEStockType, 3, "OTHER", true),
    VALUE_ROW(AddSubAcct, OESubAcct, 3, "OTHER", true),
    VALUE_ROW(AddTferAction, OETferAction, 1, "OUT", true),
    VALUE_ROW(AddUnitType, OEUnitType, 1, "CURRENCY", true),
    VALUE_ROW(AddUSProductType, OEUSProductType, 10, "UGMA", true),
    VALUE_ROW(AddBalType, OEBalType, 2, "NUMBER", true),
    VALUE_ROW(AddAssetClass, OEAssetClass, 6, "OTHER", true),
    VALUE_ROW(AddCouponFreq, OECouponFreq, 4, "OTHER", true),
    VALUE_ROW(AddPayeeIDScope, OEPayeeIDScope, 1, "USER", true),
};

// Shows what reaches AddString: the text in brackets, "|m" when macros were asked for.
class Bracketing : public OEBuilder {
public:
    using OEBuilder::AddString;
    using OEBuilder::OEBuilder;
    OEBuildStatus AddString(const OEString& value, OEBuildStringMacroOpt macros,
                            OEBuildStringCrLfOpt crlf) override {
        std::string shown = "[" + std::string(value.c_str()) + (macros == OEBSM_MACROS ? "|m" : "") + "]";
        return OEBuilder::AddString(OEString(shown.c_str()), OEBSM_NONE, crlf);
    }
};

TEST(BuilderWriters, EveryEnumerationWriterTextRefusalAndRoute) {
    for (const ValueRow& row : kValueRows) {
        SCOPED_TRACE(row.name);
        Bound b;
        EXPECT_EQ(row.write(b.builder, row.good), OEBS_OK);
        EXPECT_EQ(b.text(), std::string(row.keyword) + "\n");
        for (int bad : {row.good + 1, -1}) {
            Bound refused;
            EXPECT_EQ(row.write(refused.builder, bad), OEBS_NOTEXTFORM) << bad;
            EXPECT_EQ(refused.text(), "") << bad;
        }
        BoundTo<Bracketing> routed;
        EXPECT_EQ(row.write(routed.builder, row.good), OEBS_OK);
        EXPECT_EQ(routed.text(),
                  row.viaString ? "[" + std::string(row.keyword) + "]\n" : row.keyword + std::string("\n"));

        OEBuilder unbound; // no buffer yet: refused, not a crash
        EXPECT_EQ(row.write(unbound, row.good), OEBS_BADARGUMENT);
    }
}

// Writes the name of the value writer an element writer called, instead of the value.
class Marking : public OEBuilder {
public:
    using OEBuilder::AddString;
    using OEBuilder::OEBuilder;
    OEBuildStatus Mark(const char* writer) {
        Put(writer);
        Put(OE_NEW_LINE);
        return OEBS_OK;
    }
#define MARK(W, ...)                                                                                         \
    OEBuildStatus W(__VA_ARGS__) override {                                                                  \
        return Mark(#W);                                                                                     \
    }
    // clang-format off
    MARK(AddString, const OEString&, OEBuildStringMacroOpt, OEBuildStringCrLfOpt)
    MARK(AddDayOfWeek, OEDayOfWeek) MARK(AddProcCode, OEProcCode) MARK(AddInvAcctType, const OEInvAcctType&)
    MARK(AddDebtType, const OEDebtType&) MARK(AddDebtClass, const OEDebtClass&)
    MARK(AddCallType, const OECallType&) MARK(AddMFType, const OEMFType&) MARK(AddOptType, const OEOptType&)
    MARK(AddStockType, const OEStockType&) MARK(AddBuyType, const OEBuyType&)
    MARK(AddIncomeType, const OEIncomeType&) MARK(AddOptAction, const OEOptAction&)
    MARK(AddOptBuyType, const OEOptBuyType&) MARK(AddOptSellType, const OEOptSellType&)
    MARK(AddPosType, const OEPosType&) MARK(AddRelType, const OERelType&) MARK(AddSecured, const OESecured&)
    MARK(AddSellReason, const OESellReason&) MARK(AddSellType, const OESellType&)
    MARK(AddSubAcct, const OESubAcct&) MARK(AddTferAction, const OETferAction&)
    MARK(AddUnitType, const OEUnitType&) MARK(AddDuration, const OEDuration&)
    MARK(AddRestriction, const OERestriction&) MARK(AddBalType, const OEBalType&)
    MARK(AddAssetClass, const OEAssetClass&) MARK(AddCouponFreq, const OECouponFreq&)
    MARK(AddUnitPrice, const OEPosPrecisionInteger&) MARK(AddRate, OEPercent)
    // clang-format on
#undef MARK
};

struct ElementRow {
    const char* name;
    std::function<int(OEBuilder&, OETagID, int)> write;
    OETagID tag;
    int good;
    const char* keyword;
    const char* valueWriter; // what the element writer must call for the value
    bool convertsFirst;      // a refused value leaves not even the element tag
};

#define ELEMENT_ROW(W, T, tag, good, kw, valueWriter, first)                                                 \
    {                                                                                                        \
#W, [](OEBuilder & b, OETagID t, int v) { return b.W(t, static_cast<T>(v)); }, OETAG_##tag, good,    \
                                                                                    kw, valueWriter, first   \
    }

const ElementRow kElementRows[] = {
    ELEMENT_ROW(AddTagOEDayOfWeek, OEDayOfWeek, PROCDAYSOFF, 5, "SATURDAY", "AddDayOfWeek", false),
    ELEMENT_ROW(AddTagOEProcCode, OEProcCode, PMTPRCCODE, 1, "POSTEDON", "AddProcCode", false),
    ELEMENT_ROW(AddTagOEFrequency, OEFrequency, FREQ, 8, "ANNUALLY", "AddString", true),
    ELEMENT_ROW(AddTagOEInvAcctType, OEInvAcctType, INVACCTTYPE, 3, "CORPORATE", "AddInvAcctType", false),
    ELEMENT_ROW(AddTagOEDebtType, OEDebtType, DEBTTYPE, 1, "ZERO", "AddDebtType", false),
    ELEMENT_ROW(AddTagOEDebtClass, OEDebtClass, DEBTCLASS, 2, "CORPORATE", "AddDebtClass", false),
    ELEMENT_ROW(AddTagOECallType, OECallType, CALLTYPE, 3, "MATURITY", "AddCallType", false),
    ELEMENT_ROW(AddTagOEMFType, OEMFType, MFTYPE, 1, "CLOSEEND", "AddMFType", false),
    ELEMENT_ROW(AddTagOEOptType, OEOptType, OPTTYPE, 0, "PUT", "AddOptType", false),
    ELEMENT_ROW(AddTagOEStockType, OEStockType, STOCKTYPE, 2, "CONVERTIBLE", "AddStockType", false),
    ELEMENT_ROW(AddTagOEBuyType, OEBuyType, BUYTYPE, 0, "BUY", "AddBuyType", false),
    ELEMENT_ROW(AddTagOEIncomeType, OEIncomeType, INCOMETYPE, 3, "INTEREST", "AddIncomeType", false),
    ELEMENT_ROW(AddTagOEOptAction, OEOptAction, OPTACTION, 1, "ASSIGN", "AddOptAction", false),
    ELEMENT_ROW(AddTagOEOptBuyType, OEOptBuyType, OPTBUYTYPE, 0, "BUYTOOPEN", "AddOptBuyType", false),
    ELEMENT_ROW(AddTagOEOptSellType, OEOptSellType, OPTSELLTYPE, 0, "SELLTOOPEN", "AddOptSellType", false),
    ELEMENT_ROW(AddTagOEPosType, OEPosType, POSTYPE, 0, "LONG", "AddPosType", false),
    ELEMENT_ROW(AddTagOERelType, OERelType, RELTYPE, 1, "STRADDLE", "AddRelType", false),
    ELEMENT_ROW(AddTagOESecured, OESecured, SECURED, 0, "NAKED", "AddSecured", false),
    ELEMENT_ROW(AddTagOESellReason, OESellReason, SELLREASON, 1, "SELL", "AddSellReason", false),
    ELEMENT_ROW(AddTagOESellType, OESellType, SELLTYPE, 0, "SELL", "AddSellType", false),
    ELEMENT_ROW(AddTagOESubAcct, OESubAcct, SUBACCTSEC, 1, "MARGIN", "AddSubAcct", false),
    ELEMENT_ROW(AddTagOETferAction, OETferAction, TFERACTION, 0, "IN", "AddTferAction", false),
    ELEMENT_ROW(AddTagOEUnitType, OEUnitType, UNITTYPE, 0, "SHARES", "AddUnitType", false),
    ELEMENT_ROW(AddTagOEDuration, OEDuration, DURATION, 1, "GOODTILCANCEL", "AddDuration", false),
    ELEMENT_ROW(AddTagOERestriction, OERestriction, RESTRICTION, 0, "ALLORNONE", "AddRestriction", false),
    ELEMENT_ROW(AddTagOEBalType, OEBalType, BALTYPE, 1, "PERCENT", "AddBalType", false),
    ELEMENT_ROW(AddTagOEAssetClass, OEAssetClass, ASSETCLASS, 4, "INTLSTOCK", "AddAssetClass", false),
    ELEMENT_ROW(AddTagOECouponFreq, OECouponFreq, COUPONFREQ, 2, "SEMIANNUAL", "AddCouponFreq", false),
};

TEST(BuilderWriters, EnumerationElementsInBothFormsAndThroughTheirValueWriter) {
    for (const ElementRow& row : kElementRows) {
        SCOPED_TRACE(row.name);
        const std::string tag = OETagDictionary::TheOETagDictionary()->GetTagString(row.tag);
        const std::string open = "<" + tag + ">", close = "</" + tag + ">\n";
        for (unsigned short endTags : {0, 1, 2}) { // only exactly 1 asks for end tags
            Bound b(OEBCL_CRLF, endTags);
            EXPECT_EQ(row.write(b.builder, row.tag, row.good), OEBS_OK);
            EXPECT_EQ(b.text(), open + row.keyword + "\n" + (endTags == 1 ? close : ""));
            Bound refused(OEBCL_CRLF, endTags);
            EXPECT_EQ(row.write(refused.builder, row.tag, 99), OEBS_NOTEXTFORM);
            EXPECT_EQ(refused.text(), row.convertsFirst ? "" : open) << "never an end tag after a refusal";
        }
        BoundTo<Marking> marked(OEBCL_CRLF, 1);
        EXPECT_EQ(row.write(marked.builder, row.tag, row.good), OEBS_OK);
        EXPECT_EQ(marked.text(), open + row.valueWriter + "\n" + close);
        Bound unknownTag;
        EXPECT_EQ(row.write(unknownTag.builder, static_cast<OETagID>(60000), row.good), OEBS_BADARGUMENT);
    }
}

TEST(BuilderWriters, UnitPriceAndRateCheckTheirOwnRanges) {
    Bound b(OEBCL_CRLF, 1);
    EXPECT_EQ(b.builder.AddUnitPrice(OEPosPrecisionInteger("12.25")), OEBS_OK);
    EXPECT_EQ(b.builder.AddUnitPrice(OEPosPrecisionInteger("-0.01")), OEBS_NOTEXTFORM);
    EXPECT_EQ(b.builder.AddRate(OEPercent("100")), OEBS_OK);
    EXPECT_EQ(b.builder.AddRate(OEPercent("100.01")), OEBS_NOTEXTFORM);
    EXPECT_EQ(b.builder.AddTagOERate(OETAG_DSCRATE, OEPercent("-1")), OEBS_NOTEXTFORM);
    EXPECT_EQ(b.text(), "12.25\n100\n<DSCRATE>");

    // The unit price element goes through AddUnitPrice; the rate element writes the number itself.
    BoundTo<Marking> m(OEBCL_CRLF, 0);
    m.builder.AddTagOEUnitPrice(OETAG_UNITPRICE, OEPosPrecisionInteger("3"));
    m.builder.AddTagOERate(OETAG_DSCRATE, OEPercent("12.5"));
    EXPECT_EQ(m.text(), "<UNITPRICE>AddUnitPrice\n<DSCRATE>12.5\n");
}

TEST(BuilderWriters, StringValuedWritersEscapeAndBound) {
    BoundTo<Bracketing> routed;
    routed.builder.AddLanguage(OELanguage("ENG"));
    routed.builder.AddServerID(OEString36("S&1"));
    routed.builder.AddPayeeID(OEString12("P1"));
    EXPECT_EQ(routed.text(), "[ENG|m]\n[S&1|m]\n[P1|m]\n") << "all three escaped and ended by AddString";

    OELanguage tooLong("ENGL");
    Bound strict(OEBCL_CRLF, 1);
    EXPECT_EQ(strict.builder.AddTagOELanguage(OETAG_LANGUAGE, tooLong), OEBS_STRINGTOOLONG);
    EXPECT_EQ(strict.text(), "<LANGUAGE>");
    Bound lenient(OEBCL_CRLF, 1, OEBSO_LENIENT);
    EXPECT_EQ(lenient.builder.AddTagOELanguage(OETAG_LANGUAGE, tooLong), OEBS_OK);
    EXPECT_EQ(lenient.builder.AddTagOEPayeeID(OETAG_PAYEEID, OEString12("A<B")), OEBS_OK);
    EXPECT_EQ(lenient.builder.AddTagOEPayeeID(OETAG_PAYEEID, OEString12(" ")), OEBS_BLANKVALUE);
    EXPECT_EQ(lenient.text(), "<LANGUAGE>ENG\n</LANGUAGE>\n<PAYEEID>A&lt;B\n</PAYEEID>\n");
}

TEST(BuilderWriters, PayrollWritersNeverFail) {
    OEPayrollBuilder payroll;
    OEBuffer out;
    Probe root;
    payroll.Build(&out, &root, OEBSO_STRICT, 0, 0);
    OEPayrollAmount empty(OEPAT_EMPTY);
    OEPayrollDateTime cleared;
    cleared.SetEmpty(1);
    EXPECT_EQ(payroll.AddPayrollAmount(empty), OEBS_OK);
    EXPECT_EQ(payroll.AddPayrollDateTime(cleared), OEBS_OK);
    EXPECT_EQ(Text(out), "^@~*\n^@~*\n");
    OEPayrollBuilder unbound;
    EXPECT_EQ(unbound.AddPayrollAmount(empty), OEBS_BADARGUMENT) << "no buffer: refused, not a crash";
}

} // namespace
