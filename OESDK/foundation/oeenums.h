// Enumerations of the OFX object model whose values travel as keywords (see OEDataConversion for
// the keyword of each value). Every one has the fixed underlying type int, so that any int a caller or
// a file hands in is a valid value that the conversions can range-check and refuse, rather than an
// out-of-range enum value with undefined behaviour.
#ifndef OESDK_FOUNDATION_OEENUMS_H
#define OESDK_FOUNDATION_OEENUMS_H

enum OEAssetClass : int {
    OEAC_DOMESTICBOND = 0, // "DOMESTICBOND"
    OEAC_INTLBOND = 1,     // "INTLBOND"
    OEAC_LARGESTOCK = 2,   // "LARGESTOCK"
    OEAC_SMALLSTOCK = 3,   // "SMALLSTOCK"
    OEAC_INTLSTOCK = 4,    // "INTLSTOCK"
    OEAC_MONEYMRKT = 5,    // "MONEYMRKT"
    OEAC_OTHER = 6,        // "OTHER"
};

enum OEBalType : int {
    OEBT_DOLLAR = 0,  // "DOLLAR"
    OEBT_PERCENT = 1, // "PERCENT"
    OEBT_NUMBER = 2,  // "NUMBER"
};

enum OEBankAccountType : int {
    OEBAT_UNKNOWN = 0,    // "UNKNOWN"
    OEBAT_CHECKING = 1,   // "CHECKING"
    OEBAT_SAVINGS = 2,    // "SAVINGS"
    OEBAT_CREDIT = 3,     // "CREDIT"
    OEBAT_MONEYMRKT = 4,  // "MONEYMRKT"
    OEBAT_CREDITLINE = 5, // "CREDITLINE"
};

enum OEBankAccountType2 : int {
    OEBAT2_CHECKING = 0,   // "CHECKING"
    OEBAT2_SAVINGS = 1,    // "SAVINGS"
    OEBAT2_MONEYMRKT = 2,  // "MONEYMRKT"
    OEBAT2_CREDITLINE = 3, // "CREDITLINE"
    OEBAT2_CMA = 4,        // "CMA"
};

enum OEBankAction : int {
    OEBA_REPLACE = 0, // "REPLACE"
    OEBA_DELETE = 1,  // "DELETE"
};

enum OEBankTxType : int {
    OEBTT_CREDIT = 0,       // "CREDIT"
    OEBTT_DEBIT = 1,        // "DEBIT"
    OEBTT_INT = 2,          // "INT"
    OEBTT_DIV = 3,          // "DIV"
    OEBTT_FEE = 4,          // "FEE"
    OEBTT_SRVCHG = 5,       // "SRVCHG"
    OEBTT_DEP = 6,          // "DEP"
    OEBTT_ATM = 7,          // "ATM"
    OEBTT_POS = 8,          // "POS"
    OEBTT_XFER = 9,         // "XFER"
    OEBTT_CHECK = 10,       // "CHECK"
    OEBTT_PAYMENT = 11,     // "PAYMENT"
    OEBTT_CASH = 12,        // "CASH"
    OEBTT_DIRECTDEP = 13,   // "DIRECTDEP"
    OEBTT_DIRECTDEBIT = 14, // "DIRECTDEBIT"
    OEBTT_REPEATPMT = 15,   // "REPEATPMT"
    OEBTT_OTHER = 16,       // "OTHER"
};

enum OEBuyType : int {
    OEBUY_BUY = 0,        // "BUY"
    OEBUY_BUYTOCOVER = 1, // "BUYTOCOVER"
};

enum OECallType : int {
    OECT_CALL = 0,     // "CALL"
    OECT_PUT = 1,      // "PUT"
    OECT_PREFUND = 2,  // "PREFUND"
    OECT_MATURITY = 3, // "MATURITY"
};

enum OECharacterType : int {
    OECHT_ALPHAONLY = 0,       // "ALPHAONLY"
    OECHT_NUMERICONLY = 1,     // "NUMERICONLY"
    OECHT_ALPHAORNUMERIC = 2,  // "ALPHAORNUMERIC"
    OECHT_ALPHAANDNUMERIC = 3, // "ALPHAANDNUMERIC"
};

enum OEClientRouting : int {
    OECR_NONE = 0,    // "NONE"
    OECR_SERVICE = 1, // "SERVICE"
    OECR_MSGSET = 2,  // "MSGSET"
};

enum OECouponFreq : int {
    OECF_MONTHLY = 0,    // "MONTHLY"
    OECF_QUARTERLY = 1,  // "QUARTERLY"
    OECF_SEMIANNUAL = 2, // "SEMIANNUAL"
    OECF_ANNUAL = 3,     // "ANNUAL"
    OECF_OTHER = 4,      // "OTHER"
};

enum OEDayOfWeek : int {
    OEDOW_MONDAY = 0,    // "MONDAY"
    OEDOW_TUESDAY = 1,   // "TUESDAY"
    OEDOW_WEDNESDAY = 2, // "WEDNESDAY"
    OEDOW_THURSDAY = 3,  // "THURSDAY"
    OEDOW_FRIDAY = 4,    // "FRIDAY"
    OEDOW_SATURDAY = 5,  // "SATURDAY"
    OEDOW_SUNDAY = 6,    // "SUNDAY"
};

enum OEDebtAction : int {
    OEDA_CALLED = 0,  // "CALLED"
    OEDA_MATURED = 1, // "MATURED"
};

enum OEDebtClass : int {
    OEDC_TREASURY = 0,  // "TREASURY"
    OEDC_MUNICIPAL = 1, // "MUNICIPAL"
    OEDC_CORPORATE = 2, // "CORPORATE"
    OEDC_OTHER = 3,     // "OTHER"
};

enum OEDebtType : int {
    OEDT_COUPON = 0, // "COUPON"
    OEDT_ZERO = 1,   // "ZERO"
};

enum OEDuration : int {
    OEDUR_DAY = 0,           // "DAY"
    OEDUR_GOODTILCANCEL = 1, // "GOODTILCANCEL"
    OEDUR_IMMEDIATE = 2,     // "IMMEDIATE"
};

enum OEExtdPmtFor : int {
    OEEPF_INDIVIDUAL = 0, // "INDIVIDUAL"
    OEEPF_BUSINESS = 1,   // "BUSINESS"
};

enum OEFidelityOptBuyType : int {
    OEFOBT_BUY = 0, // "BUY"
};

enum OEFidelityOptSellType : int {
    OEFOST_SELL = 0, // "SELL"
};

enum OEFrequency : int {
    OEFREQ_WEEKLY = 0,       // "WEEKLY"
    OEFREQ_BIWEEKLY = 1,     // "BIWEEKLY"
    OEFREQ_TWICEMONTHLY = 2, // "TWICEMONTHLY"
    OEFREQ_MONTHLY = 3,      // "MONTHLY"
    OEFREQ_FOURWEEKS = 4,    // "FOURWEEKS"
    OEFREQ_BIMONTHLY = 5,    // "BIMONTHLY"
    OEFREQ_QUARTERLY = 6,    // "QUARTERLY"
    OEFREQ_SEMIANNUALLY = 7, // "SEMIANNUALLY"
    OEFREQ_ANNUALLY = 8,     // "ANNUALLY"
};

enum OEHeaderTag : int {
    OEHT_UNKNOWN = -1,      // a header line whose name is none of these
    OEHT_CONTENTTYPE = 0,   // "CONTENT-TYPE" (MIME header, no keyword here)
    OEHT_CONTENTLENGTH = 1, // "CONTENT-LENGTH" (MIME header, no keyword here)
    OEHT_OFXHEADER = 2,     // "OFXHEADER"
    OEHT_DATA = 3,          // "DATA"
    OEHT_VERSION = 4,       // "VERSION"
    OEHT_SECURITY = 5,      // "SECURITY"
    OEHT_ENCODING = 6,      // "ENCODING"
    OEHT_CHARSET = 7,       // "CHARSET"
    OEHT_COMPRESSION = 8,   // "COMPRESSION"
    OEHT_OLDFILEUID = 9,    // "OLDFILEUID"
    OEHT_NEWFILEUID = 10,   // "NEWFILEUID"
};

enum OEIncomeType : int {
    OEIT_CGLONG = 0,   // "CGLONG"
    OEIT_CGSHORT = 1,  // "CGSHORT"
    OEIT_DIV = 2,      // "DIV"
    OEIT_INTEREST = 3, // "INTEREST"
    OEIT_MISC = 4,     // "MISC"
};

enum OEInvAcctType : int {
    OEIAT_INDIVIDUAL = 0, // "INDIVIDUAL"
    OEIAT_JOINT = 1,      // "JOINT"
    OEIAT_TRUST = 2,      // "TRUST"
    OEIAT_CORPORATE = 3,  // "CORPORATE"
};

enum OEMFType : int {
    OEMFT_OPENEND = 0,  // "OPENEND"
    OEMFT_CLOSEEND = 1, // "CLOSEEND"
    OEMFT_OTHER = 2,    // "OTHER"
};

enum OEOFXCharSet : int {
    OEOCS_1252 = 0, // "1252"
};

enum OEOFXCompression : int {
    OEOCMP_NONE = 0, // "NONE"
};

enum OEOFXData : int {
    OEODATA_OFXSGML = 0, // "OFXSGML"
};

enum OEOFXEncoding : int {
    OEOENC_USASCII = 0, // "USASCII"
    OEOENC_UTF8 = 1,    // "UTF-8"
};

enum OEOFXFileUID : int {
    OEOFUID_NONE = 0, // "NONE"
};

enum OEOFXSecurity : int {
    OEOSEC_NONE = 0,  // "NONE"
    OEOSEC_TYPE1 = 1, // "TYPE1"
};

enum OEOptAction : int {
    OEOA_EXERCISE = 0, // "EXERCISE"
    OEOA_ASSIGN = 1,   // "ASSIGN"
    OEOA_EXPIRE = 2,   // "EXPIRE"
};

enum OEOptBuyType : int {
    OEOBT_BUYTOOPEN = 0,  // "BUYTOOPEN"
    OEOBT_BUYTOCLOSE = 1, // "BUYTOCLOSE"
};

enum OEOptSellType : int {
    OEOST_SELLTOOPEN = 0,  // "SELLTOOPEN"
    OEOST_SELLTOCLOSE = 1, // "SELLTOCLOSE"
};

enum OEOptType : int {
    OEOT_PUT = 0,   // "PUT"
    OEOT_CALL = 1,  // "CALL"
    OEOT_OTHER = 2, // "OTHER"
};

enum OEPayeeIDScope : int {
    OEPIS_GLOBAL = 0, // "GLOBAL"
    OEPIS_USER = 1,   // "USER"
};

enum OEPosType : int {
    OEPT_LONG = 0,  // "LONG"
    OEPT_SHORT = 1, // "SHORT"
};

enum OEProcCode : int {
    OEPC_WILLPROCESSON = 0, // "WILLPROCESSON"
    OEPC_POSTEDON = 1,      // "POSTEDON"
    OEPC_PROCESSEDON = 2,   // "PROCESSEDON"
    OEPC_NOFUNDSON = 3,     // "NOFUNDSON"
    OEPC_FAILEDON = 4,      // "FAILEDON"
    OEPC_CANCELEDON = 5,    // "CANCELEDON"
};

enum OERelType : int {
    OERT_SPREAD = 0,   // "SPREAD"
    OERT_STRADDLE = 1, // "STRADDLE"
    OERT_NONE = 2,     // "NONE"
    OERT_OTHER = 3,    // "OTHER"
};

enum OERestriction : int {
    OERES_ALLORNONE = 0, // "ALLORNONE"
    OERES_MINUNITS = 1,  // "MINUNITS"
    OERES_NONE = 2,      // "NONE"
};

enum OESecured : int {
    OESEC_NAKED = 0,   // "NAKED"
    OESEC_COVERED = 1, // "COVERED"
};

enum OESellReason : int {
    OESR_CALL = 0,     // "CALL"
    OESR_SELL = 1,     // "SELL"
    OESR_MATURITY = 2, // "MATURITY"
};

enum OESellType : int {
    OESELL_SELL = 0,      // "SELL"
    OESELL_SELLSHORT = 1, // "SELLSHORT"
};

enum OEService : int {
    OESVC_BANKSVC = 0, // "BANKSVC"
    OESVC_BPSVC = 1,   // "BPSVC"
    OESVC_INVSVC = 2,  // "INVSVC"
};

enum OEService2 : int {
    OESVC2_BANKSVC = 0, // "BANKSVC"
    OESVC2_BPSVC = 1,   // "BPSVC"
    OESVC2_INVSVC = 2,  // "INVSVC"
    OESVC2_PRESSVC = 3, // "PRESSVC"
};

enum OEServiceStatus : int {
    OESS_AVAIL = 0,  // "AVAIL"
    OESS_PEND = 1,   // "PEND"
    OESS_ACTIVE = 2, // "ACTIVE"
};

enum OEServiceStatus2 : int {
    OESS2_AVAIL = 0,    // "AVAIL"
    OESS2_PEND = 1,     // "PEND"
    OESS2_ACTIVE = 2,   // "ACTIVE"
    OESS2_REJECTED = 3, // "REJECTED"
};

enum OEStatusSeverity : int {
    OESEV_INFO = 0,  // "INFO"
    OESEV_WARN = 1,  // "WARN"
    OESEV_ERROR = 2, // "ERROR"
};

enum OEStockType : int {
    OEST_COMMON = 0,      // "COMMON"
    OEST_PREFERRED = 1,   // "PREFERRED"
    OEST_CONVERTIBLE = 2, // "CONVERTIBLE"
    OEST_OTHER = 3,       // "OTHER"
};

enum OESubAcct : int {
    OESA_CASH = 0,   // "CASH"
    OESA_MARGIN = 1, // "MARGIN"
    OESA_SHORT = 2,  // "SHORT"
    OESA_OTHER = 3,  // "OTHER"
};

enum OESyncMode : int {
    OESM_FULL = 0, // "FULL"
    OESM_LITE = 1, // "LITE"
};

enum OETferAction : int {
    OETA_IN = 0,  // "IN"
    OETA_OUT = 1, // "OUT"
};

enum OEUSProductType : int {
    OEUSPT_401K = 0,   // "401K"
    OEUSPT_403B = 1,   // "403B"
    OEUSPT_IRA = 2,    // "IRA"
    OEUSPT_KEOGH = 3,  // "KEOGH"
    OEUSPT_OTHER = 4,  // "OTHER"
    OEUSPT_SARSEP = 5, // "SARSEP"
    OEUSPT_SIMPLE = 6, // "SIMPLE"
    OEUSPT_NORMAL = 7, // "NORMAL"
    OEUSPT_TDA = 8,    // "TDA"
    OEUSPT_TRUST = 9,  // "TRUST"
    OEUSPT_UGMA = 10,  // "UGMA"
};

enum OEUnitType : int {
    OEUT_SHARES = 0,   // "SHARES"
    OEUT_CURRENCY = 1, // "CURRENCY"
};

#endif
