#include "foundation/oedataconv.h"

#include "foundation/oekeywordpair.h"
#include "foundation/oeparsewarning.h"

#include <cstdio>
#include <cstring>

namespace {

void Warn(OEParseWarning code, const char* text) {
    OELogParseWarning(code, text ? text : "", "");
}

inline char Upper(char c) {
    return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
}

bool EqualsIgnoreCase(const char* a, const char* b) {
    for (;; ++a, ++b) {
        const char x = Upper(*a);
        if (x != Upper(*b)) return false;
        if (!x) return true;
    }
}

unsigned short SetText(OEString& out, const char* text) {
    return out.Assign(text,
                      static_cast<unsigned short>(std::strlen(text) > 65534 ? 65534 : std::strlen(text)));
}

// Steps shared by the four integer conversions: parse, refuse a non-zero fraction. Returns false
// (warning logged) on failure; n then holds the integer value.
bool ParseWholeNumber(const char* text, OEPrecisionInteger& n) {
    if (!n.ConvertStringToOEPrecisionInteger(text)) return false;
    if (n.Decimal() > 0) {
        const OEPrecisionInteger whole = n.Integer();
        if (whole != n) {
            Warn(OEPW_BADFORMAT, text);
            return false;
        }
        n = whole;
    }
    return true;
}

} // namespace

unsigned short OEDataConversion::EnumToString(unsigned int value, OEString& out, unsigned short first,
                                              unsigned short last, const char* const* table) {
    if (table && value >= first && value <= last) return SetText(out, table[value]);
    char number[16];
    std::snprintf(number, sizeof number, "%u", value);
    Warn(OEPW_BADFORMAT, number);
    out.Assign("", 0);
    return 0;
}

unsigned short OEDataConversion::StringToEnum(const char* text, unsigned short& value, unsigned short first,
                                              unsigned short last, const char* const* table) {
    if (!text) {
        Warn(OEPW_NULLPOINTER, nullptr);
        return 0;
    }
    if (table) {
        const char head = Upper(text[0]);
        for (unsigned i = first; i <= last; ++i) {
            if (Upper(table[i][0]) == head && EqualsIgnoreCase(text, table[i])) {
                value = static_cast<unsigned short>(i);
                return 1;
            }
        }
    }
    Warn(OEPW_BADFORMAT, text);
    return 0;
}

unsigned short OEDataConversion::KeywordToString(unsigned int value, OEString& out, unsigned short first,
                                                 unsigned short last, const char* const* table) {
    if (value < first || value > last) return 0;
    return SetText(out, table[value]);
}

unsigned short OEDataConversion::BooleanToString(unsigned short value, OEString& out) {
    if (value > 1) return 0;
    return SetText(out, value ? "Y" : "N");
}

unsigned short OEDataConversion::StringToBoolean(const char* text, unsigned short& value) {
    if (!text) {
        Warn(OEPW_NULLPOINTER, nullptr);
        return 0;
    }
    if (text[0] == 'Y' && text[1] == '\0') {
        value = 1;
        return 1;
    }
    if (text[0] == 'N' && text[1] == '\0') {
        value = 0;
        return 1;
    }
    Warn(OEPW_BADFORMAT, text);
    return 0;
}

unsigned short OEDataConversion::StringToSShort(const char* text, std::int16_t& value) {
    OEPrecisionInteger n;
    if (!ParseWholeNumber(text, n)) return 0;
    if (n.IsNegative() && n.FitInAULong() && n.GetOEULong() == 32768u) {
        value = static_cast<std::int16_t>(-32768);
        return 1;
    }
    if (!n.FitInASShort()) {
        Warn(OEPW_OUTOFRANGE, text);
        return 0;
    }
    value = n.GetOESShort();
    return 1;
}

unsigned short OEDataConversion::StringToUShort(const char* text, std::uint16_t& value) {
    OEPrecisionInteger n;
    if (!ParseWholeNumber(text, n)) return 0;
    if (!n.FitInAUShort()) {
        Warn(OEPW_OUTOFRANGE, text);
        return 0;
    }
    value = n.GetOEUShort();
    return 1;
}

unsigned short OEDataConversion::StringToSLong(const char* text, std::int32_t& value) {
    OEPrecisionInteger n;
    if (!ParseWholeNumber(text, n)) return 0;
    if (n.IsNegative() && n.FitInAULong() && n.GetOEULong() == 2147483648u) {
        value = static_cast<std::int32_t>(-2147483647 - 1);
        return 1;
    }
    if (!n.FitInASLong()) {
        Warn(OEPW_OUTOFRANGE, text);
        return 0;
    }
    value = n.GetOESLong();
    return 1;
}

unsigned short OEDataConversion::StringToULong(const char* text, std::uint32_t& value) {
    OEPrecisionInteger n;
    if (!ParseWholeNumber(text, n)) return 0;
    if (!n.FitInAULong()) {
        Warn(OEPW_OUTOFRANGE, text);
        return 0;
    }
    value = n.GetOEULong();
    return 1;
}

unsigned short OEDataConversion::StringToRate(const char* text, OEPercent& value) {
    OEPercent n;
    if (!n.ConvertStringToOEPrecisionInteger(text)) return 0;
    value = n;
    return 1;
}

unsigned short OEDataConversion::DateTimeToString(const OEDateTime& value, OEString& out) {
    return value.GetDateString(out);
}

unsigned short OEDataConversion::TimeToString(const OETime& value, OEString& out) {
    return value.GetTimeString(out);
}

unsigned short OEDataConversion::StringToDateTime(const char* text, OEDateTime& value) {
    OEDateTime parsed;
    if (!parsed.ConvertStringToOEDateTime(text)) return 0;
    value = parsed;
    return 1;
}

unsigned short OEDataConversion::StringToTime(const char* text, OETime& value) {
    OETime parsed;
    if (!parsed.ConvertStringToOETime(text)) return 0;
    value = parsed;
    return 1;
}

unsigned short OEDataConversion::PayeeIDToString(const OEString12& value, OEString& out) {
    return SetText(out, value.c_str());
}

unsigned short OEDataConversion::StringToPayeeID(const char* text, OEString12& value) {
    if (!text || !*text) return 3;
    value = text;
    if (value.GetStrLength() > OEString12::kSpecLength) {
        Warn(OEPW_TOOLONG, text);
        return 0;
    }
    return 1;
}

unsigned short OEDataConversion::LanguageToString(const OELanguage& value, OEString& out) {
    return SetText(out, value.c_str());
}

unsigned short OEDataConversion::StringToLanguage(const char* text, OELanguage& value) {
    value = text;
    if (value.IsValid()) return 1;
    Warn(text ? OEPW_BADFORMAT : OEPW_NULLPOINTER, text);
    return 0;
}

// --- Keyword tables -------------------------------------------------------------------------

const char* const kAssetClassTable[] = {"DOMESTICBOND", "INTLBOND",  "LARGESTOCK", "SMALLSTOCK",
                                        "INTLSTOCK",    "MONEYMRKT", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, AssetClass, OEAssetClass, 0, kAssetClassTable)
OE_KEYWORD_TABLE(OEKW_ASSETCLASS, kAssetClassTable)

const char* const kBalTypeTable[] = {"DOLLAR", "PERCENT", "NUMBER"};
OE_KEYWORD_PAIR(OEDataConversion, BalType, OEBalType, 0, kBalTypeTable)
OE_KEYWORD_TABLE(OEKW_BALTYPE, kBalTypeTable)

const char* const kBankAccountTable[] = {"UNKNOWN", "CHECKING",  "SAVINGS",
                                         "CREDIT",  "MONEYMRKT", "CREDITLINE"};
OE_KEYWORD_PAIR(OEDataConversion, BankAccount, OEBankAccountType, 0, kBankAccountTable)
OE_KEYWORD_TABLE(OEKW_BANKACCOUNTTYPE, kBankAccountTable)

const char* const kBankAccount2Table[] = {"CHECKING", "SAVINGS", "MONEYMRKT", "CREDITLINE", "CMA"};
OE_KEYWORD_PAIR(OEDataConversion, BankAccount2, OEBankAccountType2, 0, kBankAccount2Table)
OE_KEYWORD_TABLE(OEKW_BANKACCOUNTTYPE2, kBankAccount2Table)

const char* const kBankActionTable[] = {"REPLACE", "DELETE"};
OE_KEYWORD_PAIR(OEDataConversion, BankAction, OEBankAction, 0, kBankActionTable)
OE_KEYWORD_TABLE(OEKW_CORRECTACTION, kBankActionTable)

const char* const kBankTxTable[] = {"CREDIT", "DEBIT",     "INT",         "DIV",       "FEE",   "SRVCHG",
                                    "DEP",    "ATM",       "POS",         "XFER",      "CHECK", "PAYMENT",
                                    "CASH",   "DIRECTDEP", "DIRECTDEBIT", "REPEATPMT", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, BankTx, OEBankTxType, 0, kBankTxTable)
OE_KEYWORD_TABLE(OEKW_BANKTXTYPE, kBankTxTable)

const char* const kBuyTypeTable[] = {"BUY", "BUYTOCOVER"};
OE_KEYWORD_PAIR(OEDataConversion, BuyType, OEBuyType, 0, kBuyTypeTable)
OE_KEYWORD_TABLE(OEKW_BUYTYPE, kBuyTypeTable)

const char* const kCallTypeTable[] = {"CALL", "PUT", "PREFUND", "MATURITY"};
OE_KEYWORD_PAIR(OEDataConversion, CallType, OECallType, 0, kCallTypeTable)
OE_KEYWORD_TABLE(OEKW_CALLTYPE, kCallTypeTable)

const char* const kCharacterTypeTable[] = {"ALPHAONLY", "NUMERICONLY", "ALPHAORNUMERIC", "ALPHAANDNUMERIC"};
OE_KEYWORD_PAIR(OEDataConversion, CharacterType, OECharacterType, 0, kCharacterTypeTable)
OE_KEYWORD_TABLE(OEKW_CHARTYPE, kCharacterTypeTable)

const char* const kClientRoutingTable[] = {"NONE", "SERVICE", "MSGSET"};
OE_KEYWORD_PAIR(OEDataConversion, ClientRouting, OEClientRouting, 0, kClientRoutingTable)
OE_KEYWORD_TABLE(OEKW_CLIENTROUTING, kClientRoutingTable)

const char* const kCouponFreqTable[] = {"MONTHLY", "QUARTERLY", "SEMIANNUAL", "ANNUAL", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, CouponFreq, OECouponFreq, 0, kCouponFreqTable)

const char* const kDayOfWeekTable[] = {"MONDAY", "TUESDAY",  "WEDNESDAY", "THURSDAY",
                                       "FRIDAY", "SATURDAY", "SUNDAY"};
OE_KEYWORD_PAIR(OEDataConversion, DayOfWeek, OEDayOfWeek, 0, kDayOfWeekTable)

const char* const kDebtActionTable[] = {"CALLED", "MATURED"};
OE_KEYWORD_PAIR(OEDataConversion, DebtAction, OEDebtAction, 0, kDebtActionTable)

const char* const kDebtClassTable[] = {"TREASURY", "MUNICIPAL", "CORPORATE", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, DebtClass, OEDebtClass, 0, kDebtClassTable)
OE_KEYWORD_TABLE(OEKW_DEBTCLASS, kDebtClassTable)

const char* const kDebtTypeTable[] = {"COUPON", "ZERO"};
OE_KEYWORD_PAIR(OEDataConversion, DebtType, OEDebtType, 0, kDebtTypeTable)
OE_KEYWORD_TABLE(OEKW_DEBTTYPE, kDebtTypeTable)

const char* const kDurationTable[] = {"DAY", "GOODTILCANCEL", "IMMEDIATE"};
OE_KEYWORD_PAIR(OEDataConversion, Duration, OEDuration, 0, kDurationTable)
OE_KEYWORD_TABLE(OEKW_DURATION, kDurationTable)

const char* const kExtdPmtForTable[] = {"INDIVIDUAL", "BUSINESS"};
OE_KEYWORD_PAIR(OEDataConversion, ExtdPmtFor, OEExtdPmtFor, 0, kExtdPmtForTable)

const char* const kFidelityOptBuyTypeTable[] = {"BUY"};
OE_KEYWORD_PAIR(OEDataConversion, FidelityOptBuyType, OEFidelityOptBuyType, 0, kFidelityOptBuyTypeTable)

const char* const kFidelityOptSellTypeTable[] = {"SELL"};
OE_KEYWORD_PAIR(OEDataConversion, FidelityOptSellType, OEFidelityOptSellType, 0, kFidelityOptSellTypeTable)

const char* const kFrequencyTable[] = {"WEEKLY",    "BIWEEKLY",  "TWICEMONTHLY", "MONTHLY", "FOURWEEKS",
                                       "BIMONTHLY", "QUARTERLY", "SEMIANNUALLY", "ANNUALLY"};
OE_KEYWORD_PAIR(OEDataConversion, Frequency, OEFrequency, 0, kFrequencyTable)

const char* const kHeaderTagTable[] = {"",          "",         "OFXHEADER", "DATA",        "VERSION",
                                       "SECURITY",  "ENCODING", "CHARSET",   "COMPRESSION", "OLDFILEUID",
                                       "NEWFILEUID"};
OE_KEYWORD_PAIR(OEDataConversion, HeaderTag, OEHeaderTag, 2, kHeaderTagTable)

const char* const kIncomeTypeTable[] = {"CGLONG", "CGSHORT", "DIV", "INTEREST", "MISC"};
OE_KEYWORD_PAIR(OEDataConversion, IncomeType, OEIncomeType, 0, kIncomeTypeTable)
OE_KEYWORD_TABLE(OEKW_INCOMETYPE, kIncomeTypeTable)

const char* const kInvAcctTypeTable[] = {"INDIVIDUAL", "JOINT", "TRUST", "CORPORATE"};
OE_KEYWORD_PAIR(OEDataConversion, InvAcctType, OEInvAcctType, 0, kInvAcctTypeTable)

const char* const kMFTypeTable[] = {"OPENEND", "CLOSEEND", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, MFType, OEMFType, 0, kMFTypeTable)
OE_KEYWORD_TABLE(OEKW_MFTYPE, kMFTypeTable)

const char* const kOFXCharSetTable[] = {"1252"};
OE_KEYWORD_PAIR(OEDataConversion, OFXCharSet, OEOFXCharSet, 0, kOFXCharSetTable)

const char* const kOFXCompressionTable[] = {"NONE"};
OE_KEYWORD_PAIR(OEDataConversion, OFXCompression, OEOFXCompression, 0, kOFXCompressionTable)

const char* const kOFXDataTable[] = {"OFXSGML"};
OE_KEYWORD_PAIR(OEDataConversion, OFXData, OEOFXData, 0, kOFXDataTable)

const char* const kOFXEncodingTable[] = {"USASCII", "UTF-8"};
OE_KEYWORD_PAIR(OEDataConversion, OFXEncoding, OEOFXEncoding, 0, kOFXEncodingTable)

const char* const kOFXFileUIDTable[] = {"NONE"};
OE_KEYWORD_PAIR(OEDataConversion, OFXFileUID, OEOFXFileUID, 0, kOFXFileUIDTable)

const char* const kOFXSecurityTable[] = {"NONE", "TYPE1"};
OE_KEYWORD_PAIR(OEDataConversion, OFXSecurity, OEOFXSecurity, 0, kOFXSecurityTable)
OE_KEYWORD_TABLE(OEKW_OFXSECURITY, kOFXSecurityTable)

const char* const kOptActionTable[] = {"EXERCISE", "ASSIGN", "EXPIRE"};
OE_KEYWORD_PAIR(OEDataConversion, OptAction, OEOptAction, 0, kOptActionTable)
OE_KEYWORD_TABLE(OEKW_OPTACTION, kOptActionTable)

const char* const kOptBuyTypeTable[] = {"BUYTOOPEN", "BUYTOCLOSE"};
OE_KEYWORD_PAIR(OEDataConversion, OptBuyType, OEOptBuyType, 0, kOptBuyTypeTable)
OE_KEYWORD_TABLE(OEKW_OPTBUYTYPE, kOptBuyTypeTable)

const char* const kOptSellTypeTable[] = {"SELLTOOPEN", "SELLTOCLOSE"};
OE_KEYWORD_PAIR(OEDataConversion, OptSellType, OEOptSellType, 0, kOptSellTypeTable)
OE_KEYWORD_TABLE(OEKW_OPTSELLTYPE, kOptSellTypeTable)

const char* const kOptTypeTable[] = {"PUT", "CALL", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, OptType, OEOptType, 0, kOptTypeTable)

const char* const kPayeeIDScopeTable[] = {"GLOBAL", "USER"};
OE_KEYWORD_PAIR(OEDataConversion, PayeeIDScope, OEPayeeIDScope, 0, kPayeeIDScopeTable)

const char* const kPosTypeTable[] = {"LONG", "SHORT"};
OE_KEYWORD_PAIR(OEDataConversion, PosType, OEPosType, 0, kPosTypeTable)
OE_KEYWORD_TABLE(OEKW_POSTYPE, kPosTypeTable)

const char* const kProcCodeTable[] = {"WILLPROCESSON", "POSTEDON", "PROCESSEDON",
                                      "NOFUNDSON",     "FAILEDON", "CANCELEDON"};
OE_KEYWORD_PAIR(OEDataConversion, ProcCode, OEProcCode, 0, kProcCodeTable)

const char* const kRelTypeTable[] = {"SPREAD", "STRADDLE", "NONE", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, RelType, OERelType, 0, kRelTypeTable)
OE_KEYWORD_TABLE(OEKW_RELTYPE, kRelTypeTable)

const char* const kRestrictionTable[] = {"ALLORNONE", "MINUNITS", "NONE"};
OE_KEYWORD_PAIR(OEDataConversion, Restriction, OERestriction, 0, kRestrictionTable)
OE_KEYWORD_TABLE(OEKW_RESTRICTION, kRestrictionTable)

const char* const kSecuredTable[] = {"NAKED", "COVERED"};
OE_KEYWORD_PAIR(OEDataConversion, Secured, OESecured, 0, kSecuredTable)
OE_KEYWORD_TABLE(OEKW_SECURED, kSecuredTable)

const char* const kSellReasonTable[] = {"CALL", "SELL", "MATURITY"};
OE_KEYWORD_PAIR(OEDataConversion, SellReason, OESellReason, 0, kSellReasonTable)
OE_KEYWORD_TABLE(OEKW_SELLREASON, kSellReasonTable)

const char* const kSellTypeTable[] = {"SELL", "SELLSHORT"};
OE_KEYWORD_PAIR(OEDataConversion, SellType, OESellType, 0, kSellTypeTable)
OE_KEYWORD_TABLE(OEKW_SELLTYPE, kSellTypeTable)

const char* const kServiceTable[] = {"BANKSVC", "BPSVC", "INVSVC"};
OE_KEYWORD_PAIR(OEDataConversion, Service, OEService, 0, kServiceTable)

const char* const kService2Table[] = {"BANKSVC", "BPSVC", "INVSVC", "PRESSVC"};
OE_KEYWORD_PAIR(OEDataConversion, Service2, OEService2, 0, kService2Table)

const char* const kServiceStatusTable[] = {"AVAIL", "PEND", "ACTIVE"};
OE_KEYWORD_PAIR(OEDataConversion, ServiceStatus, OEServiceStatus, 0, kServiceStatusTable)

const char* const kServiceStatus2Table[] = {"AVAIL", "PEND", "ACTIVE", "REJECTED"};
OE_KEYWORD_PAIR(OEDataConversion, ServiceStatus2, OEServiceStatus2, 0, kServiceStatus2Table)

const char* const kStatusSeverityTable[] = {"INFO", "WARN", "ERROR"};
OE_KEYWORD_PAIR(OEDataConversion, StatusSeverity, OEStatusSeverity, 0, kStatusSeverityTable)
OE_KEYWORD_TABLE(OEKW_SEVERITY, kStatusSeverityTable)

const char* const kStockTypeTable[] = {"COMMON", "PREFERRED", "CONVERTIBLE", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, StockType, OEStockType, 0, kStockTypeTable)
OE_KEYWORD_TABLE(OEKW_STOCKTYPE, kStockTypeTable)

const char* const kSubAcctTable[] = {"CASH", "MARGIN", "SHORT", "OTHER"};
OE_KEYWORD_PAIR(OEDataConversion, SubAcct, OESubAcct, 0, kSubAcctTable)
OE_KEYWORD_TABLE(OEKW_SUBACCT, kSubAcctTable)

const char* const kSyncModeTable[] = {"FULL", "LITE"};
OE_KEYWORD_PAIR(OEDataConversion, SyncMode, OESyncMode, 0, kSyncModeTable)
OE_KEYWORD_TABLE(OEKW_SYNCMODE, kSyncModeTable)

const char* const kTferActionTable[] = {"IN", "OUT"};
OE_KEYWORD_PAIR(OEDataConversion, TferAction, OETferAction, 0, kTferActionTable)
OE_KEYWORD_TABLE(OEKW_TFERACTION, kTferActionTable)

const char* const kUSProductTypeTable[] = {"401K",   "403B",   "IRA", "KEOGH", "OTHER", "SARSEP",
                                           "SIMPLE", "NORMAL", "TDA", "TRUST", "UGMA"};
OE_KEYWORD_PAIR(OEDataConversion, USProductType, OEUSProductType, 0, kUSProductTypeTable)

const char* const kUnitTypeTable[] = {"SHARES", "CURRENCY"};
OE_KEYWORD_PAIR(OEDataConversion, UnitType, OEUnitType, 0, kUnitTypeTable)
OE_KEYWORD_TABLE(OEKW_UNITTYPE, kUnitTypeTable)
