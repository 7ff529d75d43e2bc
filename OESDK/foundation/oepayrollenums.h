// Enumerations of the payroll message set whose values travel as keywords (see
// OEPayrollDataConversion). Fixed underlying type int, as in oeenums.h: any int is a valid value that
// the conversions range-check.
#ifndef OESDK_FOUNDATION_OEPAYROLLENUMS_H
#define OESDK_FOUNDATION_OEPAYROLLENUMS_H

enum OEAccrualPeriod : int {
    OEAP_YEARLY = 0,  // "YEARLY"
    OEAP_PAYROLL = 1, // "PAYROLL"
    OEAP_HOURLY = 2,  // "HOURLY"
};

enum OEBenefitType : int {
    OEBENT_BENEFITNONE = 0, // "BENEFITNONE"
};

enum OECalculationType : int {
    OECALC_FLATRATE = 0, // "FLATRATE"
    OECALC_PCTGROSS = 1, // "PCTGROSS"
    OECALC_PCTNET = 2,   // "PCTNET"
    OECALC_QTY = 3,      // "QTY"
    OECALC_PCTQTY = 4,   // "PCTQTY"
    OECALC_TAXTABLE = 5, // "TAXTABLE"
};

enum OEDirectDepositMode : int {
    OEDDM_NO = 0,                 // "NO"
    OEDDM_APPLIED = 1,            // "APPLIED"
    OEDDM_ACTIVE = 2,             // "ACTIVE"
    OEDDM_TERMINATED = 3,         // "TERMINATED"
    OEDDM_VERIFIED = 4,           // "VERIFIED"
    OEDDM_PENDING_ENROLLMENT = 5, // "PENDING_ENROLLMENT"
};

enum OESeasonalType : int {
    OESEAS_UNKNOWN = 0,     // "UNKNOWN"
    OESEAS_SEASONAL = 1,    // "SEASONAL"
    OESEAS_NONSEASONAL = 2, // "NONSEASONAL"
};

enum OEEmployeeGender : int {
    OEGEN_UNKNOWN = 0, // "UNKNOWN"
    OEGEN_FEMALE = 1,  // "FEMALE"
    OEGEN_MALE = 2,    // "MALE"
};

enum OEEmployeeType : int {
    OEET_REG = 0,       // "REG"
    OEET_OFFICER = 1,   // "OFFICER"
    OEET_STATUTORY = 2, // "STATUTORY"
    OEET_OWNER = 3,     // "OWNER"
    OEET_REP = 4,       // "REP"
};

enum OEFederalFilingStatus : int {
    OEFFS_SINGLE = 0,             // "SINGLE"
    OEFFS_MARRIED = 1,            // "MARRIED"
    OEFFS_HEADOFHOUSE = 2,        // "HEADOFHOUSE"
    OEFFS_HEADOFHOUSE_W42020 = 3, // "HEADOFHOUSE_W42020"
};

enum OEFederalTax : int {
    OEFT_FIT = 0,          // "FIT"
    OEFT_SS_ER = 1,        // "SS_ER"
    OEFT_SS_EE = 2,        // "SS_EE"
    OEFT_MED_ER = 3,       // "MED_ER"
    OEFT_MED_EE = 4,       // "MED_EE"
    OEFT_FUTA = 5,         // "FUTA"
    OEFT_AEIC = 6,         // "AEIC"
    OEFT_SS_ER_TIPS = 7,   // "SS_ER_TIPS"
    OEFT_SS_EE_TIPS = 8,   // "SS_EE_TIPS"
    OEFT_MED_ER_TIPS = 9,  // "MED_ER_TIPS"
    OEFT_MED_EE_TIPS = 10, // "MED_EE_TIPS"
};

enum OEFederalTaxPaymentFrequency : int {
    OEFTPF_QTRLY = 0,    // "QTRLY"
    OEFTPF_MONTHLY = 1,  // "MONTHLY"
    OEFTPF_SEMIWKLY = 2, // "SEMIWKLY"
    OEFTPF_DAILY = 3,    // "DAILY"
};

enum OEFederalW4FilingYear : int {
    OEFW4_NONE = 0,         // ""
    OEFW4_2019ORBEFORE = 1, // "2019ORBEFORE"
    OEFW4_2020ANDLATER = 2, // "2020ANDLATER"
};

enum OEGLMode : int {
    OEGLM_PENDING_ENROLLMENT = 0, // "PENDING_ENROLLMENT"
    OEGLM_ACTIVE = 1,             // "ACTIVE"
    OEGLM_CANCELLED = 2,          // "CANCELLED"
    OEGLM_PENDING_SETUP = 3,      // "PENDING_SETUP"
};

enum OEHealthCareLevel : int {
    OEHCL_EMPLOYEE = 0,   // "EMPLOYEE"
    OEHCL_SPOUSE = 1,     // "SPOUSE"
    OEHCL_DEPENDENTS = 2, // "DEPENDENTS"
};

enum OEHealthCareProvider : int {
    OEHCP_EMPLOYEE = 0, // "EMPLOYEE"
    OEHCP_COMPANY = 1,  // "COMPANY"
};

enum OEPayCheckType : int {
    OEPCT_PAYCHK = 0, // "PAYCHK"
    OEPCT_YTDADJ = 1, // "YTDADJ"
};

enum OEPayType : int {
    OEPAY_REG = 0,  // "REG"
    OEPAY_SICK = 1, // "SICK"
    OEPAY_VAC = 2,  // "VAC"
};

enum OEPayrollFrequency : int {
    OEPF_DAILY = 0,       // "DAILY"
    OEPF_WEEKLY = 1,      // "WEEKLY"
    OEPF_BIWEEKLY = 2,    // "BIWEEKLY"
    OEPF_SEMIMONTHLY = 3, // "SEMIMONTHLY"
    OEPF_MONTHLY = 4,     // "MONTHLY"
    OEPF_QUARTERLY = 5,   // "QUARTERLY"
    OEPF_YEARLY = 6,      // "YEARLY"
};

enum OEPayrollItemSpecialType : int {
    OEPIST_COMCARE = 0,      // "COMCARE"
    OEPIST_COSSEC = 1,       // "COSSEC"
    OEPIST_EEMCARE = 2,      // "EEMCARE"
    OEPIST_EESSEC = 3,       // "EESSEC"
    OEPIST_FEDTAX = 4,       // "FEDTAX"
    OEPIST_FUTA = 5,         // "FUTA"
    OEPIST_SALARY = 6,       // "SALARY"
    OEPIST_SICK_SALARY = 7,  // "SICK_SALARY"
    OEPIST_VAC_SALARY = 8,   // "VAC_SALARY"
    OEPIST_SICK_HRLY = 9,    // "SICK_HRLY"
    OEPIST_VAC_HRLY = 10,    // "VAC_HRLY"
    OEPIST_AEIC = 11,        // "AEIC"
    OEPIST_DIRDEP = 12,      // "DIRDEP"
    OEPIST_WORKER_COMP = 13, // "WORKER_COMP"
};

enum OEPayrollTestingType : int {
    OEPTT_ACH = 0, // "ACH"
    OEPTT_TAX = 1, // "TAX"
    OEPTT_Y = 2,   // "Y"
};

enum OEPayrollTxType : int {
    OEPTX_CARRYOVER = 0,     // "CARRYOVER"
    OEPTX_PRIORPMT = 1,      // "PRIORPMT"
    OEPTX_LIABADJ = 2,       // "LIABADJ"
    OEPTX_LIABCHK = 3,       // "LIABCHK"
    OEPTX_REFUND = 4,        // "REFUND"
    OEPTX_DDRETURN = 5,      // "DDRETURN"
    OEPTX_DDREVERSAL = 6,    // "DDREVERSAL"
    OEPTX_FUNDSTRANSFER = 7, // "FUNDSTRANSFER"
};

enum OEPayrollType : int {
    OEPRT_REG = 0,       // "REG"
    OEPRT_AGRI = 1,      // "AGRI"
    OEPRT_MSQE = 2,      // "MSQE"
    OEPRT_HOUSEHOLD = 3, // "HOUSEHOLD"
};

enum OEStateTax : int {
    OESTX_SIT = 0,    // "SIT"
    OESTX_SUI_ER = 1, // "SUI_ER"
    OESTX_SUI_EE = 2, // "SUI_EE"
    OESTX_SDI_ER = 3, // "SDI_ER"
    OESTX_SDI_EE = 4, // "SDI_EE"
};

enum OETaxFormLine : int {
    OETFL_NONE = 0,           // "NONE"
    OETFL_COMP = 1,           // "COMP"
    OETFL_NONTAXSICK = 2,     // "NONTAXSICK"
    OETFL_OTHER = 3,          // "OTHER"
    OETFL_TIPS = 4,           // "TIPS"
    OETFL_DPDNTCARE = 5,      // "DPDNTCARE"
    OETFL_SEC457 = 6,         // "SEC457"
    OETFL_NONQUALPLAN = 7,    // "NONQUALPLAN"
    OETFL_FRNGBNFTS = 8,      // "FRNGBNFTS"
    OETFL_OTHMVEXP = 9,       // "OTHMVEXP"
    OETFL_401K = 10,          // "401K"
    OETFL_403B = 11,          // "403B"
    OETFL_408K = 12,          // "408K"
    OETFL_457B = 13,          // "457B"
    OETFL_501C = 14,          // "501C"
    OETFL_LTAX1 = 15,         // "LTAX1"
    OETFL_LTAX2 = 16,         // "LTAX2"
    OETFL_QUALMVEX = 17,      // "QUALMVEX"
    OETFL_MEDSAVING = 18,     // "MEDSAVING"
    OETFL_SIMPLE = 19,        // "SIMPLE"
    OETFL_ADOPTION = 20,      // "ADOPTION"
    OETFL_DPDNTCARE_CO = 21,  // "DPDNTCARE_CO"
    OETFL_LTAX_CO = 22,       // "LTAX_CO"
    OETFL_GROUPTERMLIFE = 23, // "GROUPTERMLIFE"
    OETFL_ALLOCTIPS = 24,     // "ALLOCTIPS"
    OETFL_125_MEDCARE = 25,   // "125_MEDCARE"
    OETFL_125_POP = 26,       // "125_POP"
    OETFL_TTT1 = 27,          // "TTT1"
    OETFL_SEC_LOCAL = 28,     // "SEC_LOCAL"
    OETFL_TTT3 = 29,          // "TTT3"
    OETFL_ROTH401K = 30,      // "ROTH401K"
    OETFL_ROTH403B = 31,      // "ROTH403B"
    OETFL_EELOCTAX = 32,      // "EELOCTAX"
    OETFL_TTT7 = 33,          // "TTT7"
    OETFL_TTT8 = 34,          // "TTT8"
    OETFL_TTT9 = 35,          // "TTT9"
    OETFL_TTT10 = 36,         // "TTT10"
    OETFL_TTT11 = 37,         // "TTT11"
    OETFL_TTT12 = 38,         // "TTT12"
    OETFL_TTT13 = 39,         // "TTT13"
    OETFL_TTT14 = 40,         // "TTT14"
    OETFL_TTT15 = 41,         // "TTT15"
    OETFL_TTT16 = 42,         // "TTT16"
    OETFL_TTT17 = 43,         // "TTT17"
    OETFL_TTT18 = 44,         // "TTT18"
    OETFL_TTT19 = 45,         // "TTT19"
    OETFL_TTT20 = 46,         // "TTT20"
    OETFL_TTT21 = 47,         // "TTT21"
    OETFL_TTT22 = 48,         // "TTT22"
    OETFL_TTT23 = 49,         // "TTT23"
    OETFL_TTT24 = 50,         // "TTT24"
    OETFL_TTT25 = 51,         // "TTT25"
    OETFL_TTT26 = 52,         // "TTT26"
    OETFL_TTT27 = 53,         // "TTT27"
    OETFL_TTT28 = 54,         // "TTT28"
    OETFL_TTT29 = 55,         // "TTT29"
    OETFL_TTT30 = 56,         // "TTT30"
    OETFL_TTT31 = 57,         // "TTT31"
    OETFL_TTT32 = 58,         // "TTT32"
    OETFL_TTT33 = 59,         // "TTT33"
    OETFL_TTT34 = 60,         // "TTT34"
    OETFL_TTT35 = 61,         // "TTT35"
    OETFL_TTT36 = 62,         // "TTT36"
    OETFL_TTT37 = 63,         // "TTT37"
    OETFL_TTT38 = 64,         // "TTT38"
    OETFL_TTT39 = 65,         // "TTT39"
    OETFL_TTT40 = 66,         // "TTT40"
    OETFL_TTT41 = 67,         // "TTT41"
    OETFL_TTT42 = 68,         // "TTT42"
    OETFL_TTT43 = 69,         // "TTT43"
    OETFL_TTT44 = 70,         // "TTT44"
    OETFL_TTT45 = 71,         // "TTT45"
    OETFL_TTT46 = 72,         // "TTT46"
};

enum OETaxPaymentType : int {
    OETPT_LIAB = 0, // "LIAB"
    OETPT_PMT = 1,  // "PMT"
};

enum OETaxServiceMode : int {
    OETSM_NO = 0,         // "NO"
    OETSM_APPLIED = 1,    // "APPLIED"
    OETSM_ACTIVE = 2,     // "ACTIVE"
    OETSM_TERMINATED = 3, // "TERMINATED"
    OETSM_VERIFIED = 4,   // "VERIFIED"
    OETSM_NO2 = 5,        // "NO"
};

#endif
