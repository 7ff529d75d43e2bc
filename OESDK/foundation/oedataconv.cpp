#include "foundation/oedataconv.h"

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
unsigned short OEDataConversion::AssetClassToString(OEAssetClass value, OEString& out) {
    return KeywordToString(value, out, 0, 6, kAssetClassTable);
}
unsigned short OEDataConversion::StringToAssetClass(const char* text, OEAssetClass& value) {
    return KeywordToEnum(text, value, 0, 6, kAssetClassTable);
}

const char* const kBalTypeTable[] = {"DOLLAR", "PERCENT", "NUMBER"};
unsigned short OEDataConversion::BalTypeToString(OEBalType value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kBalTypeTable);
}
unsigned short OEDataConversion::StringToBalType(const char* text, OEBalType& value) {
    return KeywordToEnum(text, value, 0, 2, kBalTypeTable);
}

const char* const kBankAccountTable[] = {"UNKNOWN", "CHECKING",  "SAVINGS",
                                         "CREDIT",  "MONEYMRKT", "CREDITLINE"};
unsigned short OEDataConversion::BankAccountToString(OEBankAccountType value, OEString& out) {
    return KeywordToString(value, out, 0, 5, kBankAccountTable);
}
unsigned short OEDataConversion::StringToBankAccount(const char* text, OEBankAccountType& value) {
    return KeywordToEnum(text, value, 0, 5, kBankAccountTable);
}

const char* const kBankAccount2Table[] = {"CHECKING", "SAVINGS", "MONEYMRKT", "CREDITLINE", "CMA"};
unsigned short OEDataConversion::BankAccount2ToString(OEBankAccountType2 value, OEString& out) {
    return KeywordToString(value, out, 0, 4, kBankAccount2Table);
}
unsigned short OEDataConversion::StringToBankAccount2(const char* text, OEBankAccountType2& value) {
    return KeywordToEnum(text, value, 0, 4, kBankAccount2Table);
}

const char* const kBankActionTable[] = {"REPLACE", "DELETE"};
unsigned short OEDataConversion::BankActionToString(OEBankAction value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kBankActionTable);
}
unsigned short OEDataConversion::StringToBankAction(const char* text, OEBankAction& value) {
    return KeywordToEnum(text, value, 0, 1, kBankActionTable);
}

const char* const kBankTxTable[] = {"CREDIT", "DEBIT",     "INT",         "DIV",       "FEE",   "SRVCHG",
                                    "DEP",    "ATM",       "POS",         "XFER",      "CHECK", "PAYMENT",
                                    "CASH",   "DIRECTDEP", "DIRECTDEBIT", "REPEATPMT", "OTHER"};
unsigned short OEDataConversion::BankTxToString(OEBankTxType value, OEString& out) {
    return KeywordToString(value, out, 0, 16, kBankTxTable);
}
unsigned short OEDataConversion::StringToBankTx(const char* text, OEBankTxType& value) {
    return KeywordToEnum(text, value, 0, 16, kBankTxTable);
}

const char* const kBuyTypeTable[] = {"BUY", "BUYTOCOVER"};
unsigned short OEDataConversion::BuyTypeToString(OEBuyType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kBuyTypeTable);
}
unsigned short OEDataConversion::StringToBuyType(const char* text, OEBuyType& value) {
    return KeywordToEnum(text, value, 0, 1, kBuyTypeTable);
}

const char* const kCallTypeTable[] = {"CALL", "PUT", "PREFUND", "MATURITY"};
unsigned short OEDataConversion::CallTypeToString(OECallType value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kCallTypeTable);
}
unsigned short OEDataConversion::StringToCallType(const char* text, OECallType& value) {
    return KeywordToEnum(text, value, 0, 3, kCallTypeTable);
}

const char* const kCharacterTypeTable[] = {"ALPHAONLY", "NUMERICONLY", "ALPHAORNUMERIC", "ALPHAANDNUMERIC"};
unsigned short OEDataConversion::CharacterTypeToString(OECharacterType value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kCharacterTypeTable);
}
unsigned short OEDataConversion::StringToCharacterType(const char* text, OECharacterType& value) {
    return KeywordToEnum(text, value, 0, 3, kCharacterTypeTable);
}

const char* const kClientRoutingTable[] = {"NONE", "SERVICE", "MSGSET"};
unsigned short OEDataConversion::ClientRoutingToString(OEClientRouting value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kClientRoutingTable);
}
unsigned short OEDataConversion::StringToClientRouting(const char* text, OEClientRouting& value) {
    return KeywordToEnum(text, value, 0, 2, kClientRoutingTable);
}

const char* const kCouponFreqTable[] = {"MONTHLY", "QUARTERLY", "SEMIANNUAL", "ANNUAL", "OTHER"};
unsigned short OEDataConversion::CouponFreqToString(OECouponFreq value, OEString& out) {
    return KeywordToString(value, out, 0, 4, kCouponFreqTable);
}
unsigned short OEDataConversion::StringToCouponFreq(const char* text, OECouponFreq& value) {
    return KeywordToEnum(text, value, 0, 4, kCouponFreqTable);
}

const char* const kDayOfWeekTable[] = {"MONDAY", "TUESDAY",  "WEDNESDAY", "THURSDAY",
                                       "FRIDAY", "SATURDAY", "SUNDAY"};
unsigned short OEDataConversion::DayOfWeekToString(OEDayOfWeek value, OEString& out) {
    return KeywordToString(value, out, 0, 6, kDayOfWeekTable);
}
unsigned short OEDataConversion::StringToDayOfWeek(const char* text, OEDayOfWeek& value) {
    return KeywordToEnum(text, value, 0, 6, kDayOfWeekTable);
}

const char* const kDebtActionTable[] = {"CALLED", "MATURED"};
unsigned short OEDataConversion::DebtActionToString(OEDebtAction value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kDebtActionTable);
}
unsigned short OEDataConversion::StringToDebtAction(const char* text, OEDebtAction& value) {
    return KeywordToEnum(text, value, 0, 1, kDebtActionTable);
}

const char* const kDebtClassTable[] = {"TREASURY", "MUNICIPAL", "CORPORATE", "OTHER"};
unsigned short OEDataConversion::DebtClassToString(OEDebtClass value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kDebtClassTable);
}
unsigned short OEDataConversion::StringToDebtClass(const char* text, OEDebtClass& value) {
    return KeywordToEnum(text, value, 0, 3, kDebtClassTable);
}

const char* const kDebtTypeTable[] = {"COUPON", "ZERO"};
unsigned short OEDataConversion::DebtTypeToString(OEDebtType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kDebtTypeTable);
}
unsigned short OEDataConversion::StringToDebtType(const char* text, OEDebtType& value) {
    return KeywordToEnum(text, value, 0, 1, kDebtTypeTable);
}

const char* const kDurationTable[] = {"DAY", "GOODTILCANCEL", "IMMEDIATE"};
unsigned short OEDataConversion::DurationToString(OEDuration value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kDurationTable);
}
unsigned short OEDataConversion::StringToDuration(const char* text, OEDuration& value) {
    return KeywordToEnum(text, value, 0, 2, kDurationTable);
}

const char* const kExtdPmtForTable[] = {"INDIVIDUAL", "BUSINESS"};
unsigned short OEDataConversion::ExtdPmtForToString(OEExtdPmtFor value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kExtdPmtForTable);
}
unsigned short OEDataConversion::StringToExtdPmtFor(const char* text, OEExtdPmtFor& value) {
    return KeywordToEnum(text, value, 0, 1, kExtdPmtForTable);
}

const char* const kFidelityOptBuyTypeTable[] = {"BUY"};
unsigned short OEDataConversion::FidelityOptBuyTypeToString(OEFidelityOptBuyType value, OEString& out) {
    return KeywordToString(value, out, 0, 0, kFidelityOptBuyTypeTable);
}
unsigned short OEDataConversion::StringToFidelityOptBuyType(const char* text, OEFidelityOptBuyType& value) {
    return KeywordToEnum(text, value, 0, 0, kFidelityOptBuyTypeTable);
}

const char* const kFidelityOptSellTypeTable[] = {"SELL"};
unsigned short OEDataConversion::FidelityOptSellTypeToString(OEFidelityOptSellType value, OEString& out) {
    return KeywordToString(value, out, 0, 0, kFidelityOptSellTypeTable);
}
unsigned short OEDataConversion::StringToFidelityOptSellType(const char* text, OEFidelityOptSellType& value) {
    return KeywordToEnum(text, value, 0, 0, kFidelityOptSellTypeTable);
}

const char* const kFrequencyTable[] = {"WEEKLY",    "BIWEEKLY",  "TWICEMONTHLY", "MONTHLY", "FOURWEEKS",
                                       "BIMONTHLY", "QUARTERLY", "SEMIANNUALLY", "ANNUALLY"};
unsigned short OEDataConversion::FrequencyToString(OEFrequency value, OEString& out) {
    return KeywordToString(value, out, 0, 8, kFrequencyTable);
}
unsigned short OEDataConversion::StringToFrequency(const char* text, OEFrequency& value) {
    return KeywordToEnum(text, value, 0, 8, kFrequencyTable);
}

const char* const kHeaderTagTable[] = {"",          "",         "OFXHEADER", "DATA",        "VERSION",
                                       "SECURITY",  "ENCODING", "CHARSET",   "COMPRESSION", "OLDFILEUID",
                                       "NEWFILEUID"};
unsigned short OEDataConversion::HeaderTagToString(OEHeaderTag value, OEString& out) {
    return KeywordToString(value, out, 2, 10, kHeaderTagTable);
}
unsigned short OEDataConversion::StringToHeaderTag(const char* text, OEHeaderTag& value) {
    return KeywordToEnum(text, value, 2, 10, kHeaderTagTable);
}

const char* const kIncomeTypeTable[] = {"CGLONG", "CGSHORT", "DIV", "INTEREST", "MISC"};
unsigned short OEDataConversion::IncomeTypeToString(OEIncomeType value, OEString& out) {
    return KeywordToString(value, out, 0, 4, kIncomeTypeTable);
}
unsigned short OEDataConversion::StringToIncomeType(const char* text, OEIncomeType& value) {
    return KeywordToEnum(text, value, 0, 4, kIncomeTypeTable);
}

const char* const kInvAcctTypeTable[] = {"INDIVIDUAL", "JOINT", "TRUST", "CORPORATE"};
unsigned short OEDataConversion::InvAcctTypeToString(OEInvAcctType value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kInvAcctTypeTable);
}
unsigned short OEDataConversion::StringToInvAcctType(const char* text, OEInvAcctType& value) {
    return KeywordToEnum(text, value, 0, 3, kInvAcctTypeTable);
}

const char* const kMFTypeTable[] = {"OPENEND", "CLOSEEND", "OTHER"};
unsigned short OEDataConversion::MFTypeToString(OEMFType value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kMFTypeTable);
}
unsigned short OEDataConversion::StringToMFType(const char* text, OEMFType& value) {
    return KeywordToEnum(text, value, 0, 2, kMFTypeTable);
}

const char* const kOFXCharSetTable[] = {"1252"};
unsigned short OEDataConversion::OFXCharSetToString(OEOFXCharSet value, OEString& out) {
    return KeywordToString(value, out, 0, 0, kOFXCharSetTable);
}
unsigned short OEDataConversion::StringToOFXCharSet(const char* text, OEOFXCharSet& value) {
    return KeywordToEnum(text, value, 0, 0, kOFXCharSetTable);
}

const char* const kOFXCompressionTable[] = {"NONE"};
unsigned short OEDataConversion::OFXCompressionToString(OEOFXCompression value, OEString& out) {
    return KeywordToString(value, out, 0, 0, kOFXCompressionTable);
}
unsigned short OEDataConversion::StringToOFXCompression(const char* text, OEOFXCompression& value) {
    return KeywordToEnum(text, value, 0, 0, kOFXCompressionTable);
}

const char* const kOFXDataTable[] = {"OFXSGML"};
unsigned short OEDataConversion::OFXDataToString(OEOFXData value, OEString& out) {
    return KeywordToString(value, out, 0, 0, kOFXDataTable);
}
unsigned short OEDataConversion::StringToOFXData(const char* text, OEOFXData& value) {
    return KeywordToEnum(text, value, 0, 0, kOFXDataTable);
}

const char* const kOFXEncodingTable[] = {"USASCII", "UTF-8"};
unsigned short OEDataConversion::OFXEncodingToString(OEOFXEncoding value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kOFXEncodingTable);
}
unsigned short OEDataConversion::StringToOFXEncoding(const char* text, OEOFXEncoding& value) {
    return KeywordToEnum(text, value, 0, 1, kOFXEncodingTable);
}

const char* const kOFXFileUIDTable[] = {"NONE"};
unsigned short OEDataConversion::OFXFileUIDToString(OEOFXFileUID value, OEString& out) {
    return KeywordToString(value, out, 0, 0, kOFXFileUIDTable);
}
unsigned short OEDataConversion::StringToOFXFileUID(const char* text, OEOFXFileUID& value) {
    return KeywordToEnum(text, value, 0, 0, kOFXFileUIDTable);
}

const char* const kOFXSecurityTable[] = {"NONE", "TYPE1"};
unsigned short OEDataConversion::OFXSecurityToString(OEOFXSecurity value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kOFXSecurityTable);
}
unsigned short OEDataConversion::StringToOFXSecurity(const char* text, OEOFXSecurity& value) {
    return KeywordToEnum(text, value, 0, 1, kOFXSecurityTable);
}

const char* const kOptActionTable[] = {"EXERCISE", "ASSIGN", "EXPIRE"};
unsigned short OEDataConversion::OptActionToString(OEOptAction value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kOptActionTable);
}
unsigned short OEDataConversion::StringToOptAction(const char* text, OEOptAction& value) {
    return KeywordToEnum(text, value, 0, 2, kOptActionTable);
}

const char* const kOptBuyTypeTable[] = {"BUYTOOPEN", "BUYTOCLOSE"};
unsigned short OEDataConversion::OptBuyTypeToString(OEOptBuyType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kOptBuyTypeTable);
}
unsigned short OEDataConversion::StringToOptBuyType(const char* text, OEOptBuyType& value) {
    return KeywordToEnum(text, value, 0, 1, kOptBuyTypeTable);
}

const char* const kOptSellTypeTable[] = {"SELLTOOPEN", "SELLTOCLOSE"};
unsigned short OEDataConversion::OptSellTypeToString(OEOptSellType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kOptSellTypeTable);
}
unsigned short OEDataConversion::StringToOptSellType(const char* text, OEOptSellType& value) {
    return KeywordToEnum(text, value, 0, 1, kOptSellTypeTable);
}

const char* const kOptTypeTable[] = {"PUT", "CALL", "OTHER"};
unsigned short OEDataConversion::OptTypeToString(OEOptType value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kOptTypeTable);
}
unsigned short OEDataConversion::StringToOptType(const char* text, OEOptType& value) {
    return KeywordToEnum(text, value, 0, 2, kOptTypeTable);
}

const char* const kPayeeIDScopeTable[] = {"GLOBAL", "USER"};
unsigned short OEDataConversion::PayeeIDScopeToString(OEPayeeIDScope value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kPayeeIDScopeTable);
}
unsigned short OEDataConversion::StringToPayeeIDScope(const char* text, OEPayeeIDScope& value) {
    return KeywordToEnum(text, value, 0, 1, kPayeeIDScopeTable);
}

const char* const kPosTypeTable[] = {"LONG", "SHORT"};
unsigned short OEDataConversion::PosTypeToString(OEPosType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kPosTypeTable);
}
unsigned short OEDataConversion::StringToPosType(const char* text, OEPosType& value) {
    return KeywordToEnum(text, value, 0, 1, kPosTypeTable);
}

const char* const kProcCodeTable[] = {"WILLPROCESSON", "POSTEDON", "PROCESSEDON",
                                      "NOFUNDSON",     "FAILEDON", "CANCELEDON"};
unsigned short OEDataConversion::ProcCodeToString(OEProcCode value, OEString& out) {
    return KeywordToString(value, out, 0, 5, kProcCodeTable);
}
unsigned short OEDataConversion::StringToProcCode(const char* text, OEProcCode& value) {
    return KeywordToEnum(text, value, 0, 5, kProcCodeTable);
}

const char* const kRelTypeTable[] = {"SPREAD", "STRADDLE", "NONE", "OTHER"};
unsigned short OEDataConversion::RelTypeToString(OERelType value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kRelTypeTable);
}
unsigned short OEDataConversion::StringToRelType(const char* text, OERelType& value) {
    return KeywordToEnum(text, value, 0, 3, kRelTypeTable);
}

const char* const kRestrictionTable[] = {"ALLORNONE", "MINUNITS", "NONE"};
unsigned short OEDataConversion::RestrictionToString(OERestriction value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kRestrictionTable);
}
unsigned short OEDataConversion::StringToRestriction(const char* text, OERestriction& value) {
    return KeywordToEnum(text, value, 0, 2, kRestrictionTable);
}

const char* const kSecuredTable[] = {"NAKED", "COVERED"};
unsigned short OEDataConversion::SecuredToString(OESecured value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kSecuredTable);
}
unsigned short OEDataConversion::StringToSecured(const char* text, OESecured& value) {
    return KeywordToEnum(text, value, 0, 1, kSecuredTable);
}

const char* const kSellReasonTable[] = {"CALL", "SELL", "MATURITY"};
unsigned short OEDataConversion::SellReasonToString(OESellReason value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kSellReasonTable);
}
unsigned short OEDataConversion::StringToSellReason(const char* text, OESellReason& value) {
    return KeywordToEnum(text, value, 0, 2, kSellReasonTable);
}

const char* const kSellTypeTable[] = {"SELL", "SELLSHORT"};
unsigned short OEDataConversion::SellTypeToString(OESellType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kSellTypeTable);
}
unsigned short OEDataConversion::StringToSellType(const char* text, OESellType& value) {
    return KeywordToEnum(text, value, 0, 1, kSellTypeTable);
}

const char* const kServiceTable[] = {"BANKSVC", "BPSVC", "INVSVC"};
unsigned short OEDataConversion::ServiceToString(OEService value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kServiceTable);
}
unsigned short OEDataConversion::StringToService(const char* text, OEService& value) {
    return KeywordToEnum(text, value, 0, 2, kServiceTable);
}

const char* const kService2Table[] = {"BANKSVC", "BPSVC", "INVSVC", "PRESSVC"};
unsigned short OEDataConversion::Service2ToString(OEService2 value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kService2Table);
}
unsigned short OEDataConversion::StringToService2(const char* text, OEService2& value) {
    return KeywordToEnum(text, value, 0, 3, kService2Table);
}

const char* const kServiceStatusTable[] = {"AVAIL", "PEND", "ACTIVE"};
unsigned short OEDataConversion::ServiceStatusToString(OEServiceStatus value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kServiceStatusTable);
}
unsigned short OEDataConversion::StringToServiceStatus(const char* text, OEServiceStatus& value) {
    return KeywordToEnum(text, value, 0, 2, kServiceStatusTable);
}

const char* const kServiceStatus2Table[] = {"AVAIL", "PEND", "ACTIVE", "REJECTED"};
unsigned short OEDataConversion::ServiceStatus2ToString(OEServiceStatus2 value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kServiceStatus2Table);
}
unsigned short OEDataConversion::StringToServiceStatus2(const char* text, OEServiceStatus2& value) {
    return KeywordToEnum(text, value, 0, 3, kServiceStatus2Table);
}

const char* const kStatusSeverityTable[] = {"INFO", "WARN", "ERROR"};
unsigned short OEDataConversion::StatusSeverityToString(OEStatusSeverity value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kStatusSeverityTable);
}
unsigned short OEDataConversion::StringToStatusSeverity(const char* text, OEStatusSeverity& value) {
    return KeywordToEnum(text, value, 0, 2, kStatusSeverityTable);
}

const char* const kStockTypeTable[] = {"COMMON", "PREFERRED", "CONVERTIBLE", "OTHER"};
unsigned short OEDataConversion::StockTypeToString(OEStockType value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kStockTypeTable);
}
unsigned short OEDataConversion::StringToStockType(const char* text, OEStockType& value) {
    return KeywordToEnum(text, value, 0, 3, kStockTypeTable);
}

const char* const kSubAcctTable[] = {"CASH", "MARGIN", "SHORT", "OTHER"};
unsigned short OEDataConversion::SubAcctToString(OESubAcct value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kSubAcctTable);
}
unsigned short OEDataConversion::StringToSubAcct(const char* text, OESubAcct& value) {
    return KeywordToEnum(text, value, 0, 3, kSubAcctTable);
}

const char* const kSyncModeTable[] = {"FULL", "LITE"};
unsigned short OEDataConversion::SyncModeToString(OESyncMode value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kSyncModeTable);
}
unsigned short OEDataConversion::StringToSyncMode(const char* text, OESyncMode& value) {
    return KeywordToEnum(text, value, 0, 1, kSyncModeTable);
}

const char* const kTferActionTable[] = {"IN", "OUT"};
unsigned short OEDataConversion::TferActionToString(OETferAction value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kTferActionTable);
}
unsigned short OEDataConversion::StringToTferAction(const char* text, OETferAction& value) {
    return KeywordToEnum(text, value, 0, 1, kTferActionTable);
}

const char* const kUSProductTypeTable[] = {"401K",   "403B",   "IRA", "KEOGH", "OTHER", "SARSEP",
                                           "SIMPLE", "NORMAL", "TDA", "TRUST", "UGMA"};
unsigned short OEDataConversion::USProductTypeToString(OEUSProductType value, OEString& out) {
    return KeywordToString(value, out, 0, 10, kUSProductTypeTable);
}
unsigned short OEDataConversion::StringToUSProductType(const char* text, OEUSProductType& value) {
    return KeywordToEnum(text, value, 0, 10, kUSProductTypeTable);
}

const char* const kUnitTypeTable[] = {"SHARES", "CURRENCY"};
unsigned short OEDataConversion::UnitTypeToString(OEUnitType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kUnitTypeTable);
}
unsigned short OEDataConversion::StringToUnitType(const char* text, OEUnitType& value) {
    return KeywordToEnum(text, value, 0, 1, kUnitTypeTable);
}
