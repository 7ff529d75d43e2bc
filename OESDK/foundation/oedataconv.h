// OEDataConversion: the conversions between the text of an OFX element and its typed value,
// used by every aggregate's element handler (text to value) and by every Build (value to text).
//
// Results are 1 on success and 0 on failure unless noted. Every failed text-to-value conversion
// logs exactly one warning in the calling thread's parse log, with the offending text and an
// empty context: 4 malformed or unknown keyword, 5 out of range, 6 too long for its bounded
// string (the text is still stored), 8 missing text. On failure the output is left as it was.
//
// Keyword lookups ignore ASCII case and take the first matching keyword. The value-to-keyword
// functions refuse (0, output untouched, nothing logged) a value outside their enumeration, so a
// stray value never reads past a table.
#ifndef OESDK_FOUNDATION_OEDATACONV_H
#define OESDK_FOUNDATION_OEDATACONV_H

#include "oeexport.h"
#include "foundation/oedatetime.h"
#include "foundation/oeenums.h"
#include "foundation/oelanguage.h"
#include "foundation/oeprecision.h"
#include "foundation/oestring.h"

#include <atomic>
#include <cstdint>

// A keyword table of an enumeration: keyword i is the text of value i. The aggregates' enumeration
// elements use the conversions' own tables below, so each enumeration's words exist once.
struct OEKeywordTable {
    const char* const* m_words;
    unsigned short m_count;
    // The aggregates' case-insensitive lookup over the words, built on first use (null before).
    mutable std::atomic<const void*> m_lookup{nullptr};
};

extern OE_API const OEKeywordTable OEKW_BANKACCOUNTTYPE;  // ACCTTYPE: "UNKNOWN", "CHECKING", ...
extern OE_API const OEKeywordTable OEKW_BANKACCOUNTTYPE2; // ACCTTYPE2: "CHECKING", "SAVINGS", ...
extern OE_API const OEKeywordTable OEKW_BALTYPE;          // "DOLLAR", "PERCENT", "NUMBER"
extern OE_API const OEKeywordTable OEKW_BANKTXTYPE;       // TRNTYPE: "CREDIT" ... "OTHER" (17)
extern OE_API const OEKeywordTable OEKW_CORRECTACTION;    // "REPLACE", "DELETE"
extern OE_API const OEKeywordTable OEKW_OFXSECURITY;      // "NONE", "TYPE1"
extern OE_API const OEKeywordTable OEKW_SYNCMODE;         // "FULL", "LITE"
extern OE_API const OEKeywordTable OEKW_CHARTYPE;         // "ALPHAONLY", "NUMERICONLY", ...
extern OE_API const OEKeywordTable OEKW_CLIENTROUTING;    // "NONE", "SERVICE", "MSGSET"
extern OE_API const OEKeywordTable OEKW_SEVERITY;         // "INFO", "WARN", "ERROR"
extern OE_API const OEKeywordTable OEKW_ASSETCLASS;       // "DOMESTICBOND" ... "OTHER"
extern OE_API const OEKeywordTable OEKW_DEBTTYPE;         // "COUPON", "ZERO"
extern OE_API const OEKeywordTable OEKW_DEBTCLASS;        // "TREASURY" ... "OTHER"
extern OE_API const OEKeywordTable OEKW_CALLTYPE;         // "CALL", "PUT", "PREFUND", "MATURITY"
extern OE_API const OEKeywordTable OEKW_MFTYPE;           // "OPENEND", "CLOSEEND", "OTHER"
extern OE_API const OEKeywordTable OEKW_STOCKTYPE;        // "COMMON" ... "OTHER"
extern OE_API const OEKeywordTable OEKW_SUBACCT;          // "CASH", "MARGIN", "SHORT", "OTHER"
extern OE_API const OEKeywordTable OEKW_DURATION;         // "DAY", "GOODTILCANCEL", "IMMEDIATE"
extern OE_API const OEKeywordTable OEKW_RESTRICTION;      // "ALLORNONE", "MINUNITS", "NONE"
extern OE_API const OEKeywordTable OEKW_BUYTYPE;          // "BUY", "BUYTOCOVER"
extern OE_API const OEKeywordTable OEKW_SELLTYPE;         // "SELL", "SELLSHORT"
extern OE_API const OEKeywordTable OEKW_UNITTYPE;         // "SHARES", "CURRENCY"
extern OE_API const OEKeywordTable OEKW_OPTBUYTYPE;       // "BUYTOOPEN", "BUYTOCLOSE"
extern OE_API const OEKeywordTable OEKW_OPTSELLTYPE;      // "SELLTOOPEN", "SELLTOCLOSE"
extern OE_API const OEKeywordTable OEKW_INCOMETYPE;       // "CGLONG" ... "MISC"
extern OE_API const OEKeywordTable OEKW_OPTACTION;        // "EXERCISE", "ASSIGN", "EXPIRE"
extern OE_API const OEKeywordTable OEKW_POSTYPE;          // "LONG", "SHORT"
extern OE_API const OEKeywordTable OEKW_RELTYPE;          // "SPREAD", "STRADDLE", "NONE", "OTHER"
extern OE_API const OEKeywordTable OEKW_SECURED;          // "NAKED", "COVERED"
extern OE_API const OEKeywordTable OEKW_SELLREASON;       // "CALL", "SELL", "MATURITY"
extern OE_API const OEKeywordTable OEKW_TFERACTION;       // "IN", "OUT"

class OE_API OEDataConversion {
public:
    // The keyword of value (first <= value <= last); otherwise warning 4, out emptied, 0.
    static unsigned short EnumToString(unsigned int value, OEString& out, unsigned short first,
                                       unsigned short last, const char* const* table);
    // Index of the first keyword among first..last equal to text ignoring case; otherwise
    // warning 4 and 0.
    static unsigned short StringToEnum(const char* text, unsigned short& value, unsigned short first,
                                       unsigned short last, const char* const* table);

    // "Y" / "N" exactly.
    static unsigned short BooleanToString(unsigned short value, OEString& out);
    static unsigned short StringToBoolean(const char* text, unsigned short& value);

    // Decimal text (signs, ',' grouping and a point are accepted); a non-zero fraction is
    // refused (4), a value out of range too (5). The unsigned forms ignore the sign.
    static unsigned short StringToSShort(const char* text, std::int16_t& value);
    static unsigned short StringToUShort(const char* text, std::uint16_t& value);
    static unsigned short StringToSLong(const char* text, std::int32_t& value);
    static unsigned short StringToULong(const char* text, std::uint32_t& value);

    // Converts the text as a number; the 0-100 range is not checked here.
    static unsigned short StringToRate(const char* text, OEPercent& value);

    static unsigned short DateTimeToString(const OEDateTime& value, OEString& out);
    static unsigned short TimeToString(const OETime& value, OEString& out);
    static unsigned short StringToDateTime(const char* text, OEDateTime& value);
    static unsigned short StringToTime(const char* text, OETime& value);

    static unsigned short PayeeIDToString(const OEString12& value, OEString& out);
    // An empty text returns 3 (nothing stored); a text over 12 characters is stored whole,
    // logged (6) and returns 0.
    static unsigned short StringToPayeeID(const char* text, OEString12& value);

    static unsigned short LanguageToString(const OELanguage& value, OEString& out);
    // Assigns the text and returns the language's validity check.
    static unsigned short StringToLanguage(const char* text, OELanguage& value);

    // One pair per enumeration.
    static unsigned short AssetClassToString(OEAssetClass value, OEString& out);
    static unsigned short StringToAssetClass(const char* text, OEAssetClass& value);
    static unsigned short BalTypeToString(OEBalType value, OEString& out);
    static unsigned short StringToBalType(const char* text, OEBalType& value);
    static unsigned short BankAccountToString(OEBankAccountType value, OEString& out);
    static unsigned short StringToBankAccount(const char* text, OEBankAccountType& value);
    static unsigned short BankAccount2ToString(OEBankAccountType2 value, OEString& out);
    static unsigned short StringToBankAccount2(const char* text, OEBankAccountType2& value);
    static unsigned short BankActionToString(OEBankAction value, OEString& out);
    static unsigned short StringToBankAction(const char* text, OEBankAction& value);
    static unsigned short BankTxToString(OEBankTxType value, OEString& out);
    static unsigned short StringToBankTx(const char* text, OEBankTxType& value);
    static unsigned short BuyTypeToString(OEBuyType value, OEString& out);
    static unsigned short StringToBuyType(const char* text, OEBuyType& value);
    static unsigned short CallTypeToString(OECallType value, OEString& out);
    static unsigned short StringToCallType(const char* text, OECallType& value);
    static unsigned short CharacterTypeToString(OECharacterType value, OEString& out);
    static unsigned short StringToCharacterType(const char* text, OECharacterType& value);
    static unsigned short ClientRoutingToString(OEClientRouting value, OEString& out);
    static unsigned short StringToClientRouting(const char* text, OEClientRouting& value);
    static unsigned short CouponFreqToString(OECouponFreq value, OEString& out);
    static unsigned short StringToCouponFreq(const char* text, OECouponFreq& value);
    static unsigned short DayOfWeekToString(OEDayOfWeek value, OEString& out);
    static unsigned short StringToDayOfWeek(const char* text, OEDayOfWeek& value);
    static unsigned short DebtActionToString(OEDebtAction value, OEString& out);
    static unsigned short StringToDebtAction(const char* text, OEDebtAction& value);
    static unsigned short DebtClassToString(OEDebtClass value, OEString& out);
    static unsigned short StringToDebtClass(const char* text, OEDebtClass& value);
    static unsigned short DebtTypeToString(OEDebtType value, OEString& out);
    static unsigned short StringToDebtType(const char* text, OEDebtType& value);
    static unsigned short DurationToString(OEDuration value, OEString& out);
    static unsigned short StringToDuration(const char* text, OEDuration& value);
    static unsigned short ExtdPmtForToString(OEExtdPmtFor value, OEString& out);
    static unsigned short StringToExtdPmtFor(const char* text, OEExtdPmtFor& value);
    static unsigned short FidelityOptBuyTypeToString(OEFidelityOptBuyType value, OEString& out);
    static unsigned short StringToFidelityOptBuyType(const char* text, OEFidelityOptBuyType& value);
    static unsigned short FidelityOptSellTypeToString(OEFidelityOptSellType value, OEString& out);
    static unsigned short StringToFidelityOptSellType(const char* text, OEFidelityOptSellType& value);
    static unsigned short FrequencyToString(OEFrequency value, OEString& out);
    static unsigned short StringToFrequency(const char* text, OEFrequency& value);
    static unsigned short HeaderTagToString(OEHeaderTag value, OEString& out);
    static unsigned short StringToHeaderTag(const char* text, OEHeaderTag& value);
    static unsigned short IncomeTypeToString(OEIncomeType value, OEString& out);
    static unsigned short StringToIncomeType(const char* text, OEIncomeType& value);
    static unsigned short InvAcctTypeToString(OEInvAcctType value, OEString& out);
    static unsigned short StringToInvAcctType(const char* text, OEInvAcctType& value);
    static unsigned short MFTypeToString(OEMFType value, OEString& out);
    static unsigned short StringToMFType(const char* text, OEMFType& value);
    static unsigned short OFXCharSetToString(OEOFXCharSet value, OEString& out);
    static unsigned short StringToOFXCharSet(const char* text, OEOFXCharSet& value);
    static unsigned short OFXCompressionToString(OEOFXCompression value, OEString& out);
    static unsigned short StringToOFXCompression(const char* text, OEOFXCompression& value);
    static unsigned short OFXDataToString(OEOFXData value, OEString& out);
    static unsigned short StringToOFXData(const char* text, OEOFXData& value);
    static unsigned short OFXEncodingToString(OEOFXEncoding value, OEString& out);
    static unsigned short StringToOFXEncoding(const char* text, OEOFXEncoding& value);
    static unsigned short OFXFileUIDToString(OEOFXFileUID value, OEString& out);
    static unsigned short StringToOFXFileUID(const char* text, OEOFXFileUID& value);
    static unsigned short OFXSecurityToString(OEOFXSecurity value, OEString& out);
    static unsigned short StringToOFXSecurity(const char* text, OEOFXSecurity& value);
    static unsigned short OptActionToString(OEOptAction value, OEString& out);
    static unsigned short StringToOptAction(const char* text, OEOptAction& value);
    static unsigned short OptBuyTypeToString(OEOptBuyType value, OEString& out);
    static unsigned short StringToOptBuyType(const char* text, OEOptBuyType& value);
    static unsigned short OptSellTypeToString(OEOptSellType value, OEString& out);
    static unsigned short StringToOptSellType(const char* text, OEOptSellType& value);
    static unsigned short OptTypeToString(OEOptType value, OEString& out);
    static unsigned short StringToOptType(const char* text, OEOptType& value);
    static unsigned short PayeeIDScopeToString(OEPayeeIDScope value, OEString& out);
    static unsigned short StringToPayeeIDScope(const char* text, OEPayeeIDScope& value);
    static unsigned short PosTypeToString(OEPosType value, OEString& out);
    static unsigned short StringToPosType(const char* text, OEPosType& value);
    static unsigned short ProcCodeToString(OEProcCode value, OEString& out);
    static unsigned short StringToProcCode(const char* text, OEProcCode& value);
    static unsigned short RelTypeToString(OERelType value, OEString& out);
    static unsigned short StringToRelType(const char* text, OERelType& value);
    static unsigned short RestrictionToString(OERestriction value, OEString& out);
    static unsigned short StringToRestriction(const char* text, OERestriction& value);
    static unsigned short SecuredToString(OESecured value, OEString& out);
    static unsigned short StringToSecured(const char* text, OESecured& value);
    static unsigned short SellReasonToString(OESellReason value, OEString& out);
    static unsigned short StringToSellReason(const char* text, OESellReason& value);
    static unsigned short SellTypeToString(OESellType value, OEString& out);
    static unsigned short StringToSellType(const char* text, OESellType& value);
    static unsigned short ServiceToString(OEService value, OEString& out);
    static unsigned short StringToService(const char* text, OEService& value);
    static unsigned short Service2ToString(OEService2 value, OEString& out);
    static unsigned short StringToService2(const char* text, OEService2& value);
    static unsigned short ServiceStatusToString(OEServiceStatus value, OEString& out);
    static unsigned short StringToServiceStatus(const char* text, OEServiceStatus& value);
    static unsigned short ServiceStatus2ToString(OEServiceStatus2 value, OEString& out);
    static unsigned short StringToServiceStatus2(const char* text, OEServiceStatus2& value);
    static unsigned short StatusSeverityToString(OEStatusSeverity value, OEString& out);
    static unsigned short StringToStatusSeverity(const char* text, OEStatusSeverity& value);
    static unsigned short StockTypeToString(OEStockType value, OEString& out);
    static unsigned short StringToStockType(const char* text, OEStockType& value);
    static unsigned short SubAcctToString(OESubAcct value, OEString& out);
    static unsigned short StringToSubAcct(const char* text, OESubAcct& value);
    static unsigned short SyncModeToString(OESyncMode value, OEString& out);
    static unsigned short StringToSyncMode(const char* text, OESyncMode& value);
    static unsigned short TferActionToString(OETferAction value, OEString& out);
    static unsigned short StringToTferAction(const char* text, OETferAction& value);
    static unsigned short USProductTypeToString(OEUSProductType value, OEString& out);
    static unsigned short StringToUSProductType(const char* text, OEUSProductType& value);
    static unsigned short UnitTypeToString(OEUnitType value, OEString& out);
    static unsigned short StringToUnitType(const char* text, OEUnitType& value);

protected:
    // Keyword of a value of an enumeration; 0 (nothing logged, out untouched) outside first..last.
    static unsigned short KeywordToString(unsigned int value, OEString& out, unsigned short first,
                                          unsigned short last, const char* const* table);
    template <class E>
    static unsigned short KeywordToEnum(const char* text, E& value, unsigned short first, unsigned short last,
                                        const char* const* table) {
        unsigned short v = 0;
        if (!StringToEnum(text, v, first, last, table)) return 0;
        value = static_cast<E>(v);
        return 1;
    }
};

#endif
