#include "foundation/oepayrolldataconv.h"

#include "foundation/oekeywordpair.h"

#include <cstring>

unsigned short OEPayrollDataConversion::StringToPayrollDateTime(const char* text, OEPayrollDateTime& value) {
    OEPayrollDateTime parsed(value);
    if (!parsed.Assign(text)) return 0;
    value = parsed;
    return 1;
}

unsigned short OEPayrollDataConversion::PayrollDateTimeToString(const OEPayrollDateTime& value,
                                                                OEString& out) {
    return value.GetDateString(out);
}

unsigned short OEPayrollDataConversion::StringToPayrollAmount(const char* text, OEPayrollAmount& value) {
    OEPayrollAmount parsed(value);
    if (!parsed.Assign(text)) return 0;
    value = parsed;
    return 1;
}

unsigned short OEPayrollDataConversion::PayrollAmountToString(const OEPayrollAmount& value, OEString& out) {
    OEPayrollAmount copy(value);
    const char* text = copy;
    if (!text) return 0;
    return out.Assign(text, static_cast<unsigned short>(std::strlen(text)));
}

// --- Keyword tables -------------------------------------------------------------------------

const char* const kAccrualPeriodTable[] = {"YEARLY", "PAYROLL", "HOURLY"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, AccrualPeriod, OEAccrualPeriod, 0, kAccrualPeriodTable)

const char* const kBenefitTypeTable[] = {"BENEFITNONE"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, BenefitType, OEBenefitType, 0, kBenefitTypeTable)

const char* const kCalculationTypeTable[] = {"FLATRATE", "PCTGROSS", "PCTNET", "QTY", "PCTQTY", "TAXTABLE"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, CalculationType, OECalculationType, 0, kCalculationTypeTable)

const char* const kDirectDepositModeTable[] = {"NO",         "APPLIED",  "ACTIVE",
                                               "TERMINATED", "VERIFIED", "PENDING_ENROLLMENT"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, DirectDepositMode, OEDirectDepositMode, 0, kDirectDepositModeTable)

const char* const kEmpSeasonalTypeTable[] = {"UNKNOWN", "SEASONAL", "NONSEASONAL"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, EmpSeasonalType, OESeasonalType, 0, kEmpSeasonalTypeTable)

const char* const kEmployeeGenderTable[] = {"UNKNOWN", "FEMALE", "MALE"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, EmployeeGender, OEEmployeeGender, 0, kEmployeeGenderTable)

const char* const kEmployeeTypeTable[] = {"REG", "OFFICER", "STATUTORY", "OWNER", "REP"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, EmployeeType, OEEmployeeType, 0, kEmployeeTypeTable)

const char* const kFederalFilingStatusTable[] = {"SINGLE", "MARRIED", "HEADOFHOUSE", "HEADOFHOUSE_W42020"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, FederalFilingStatus, OEFederalFilingStatus, 0,
                kFederalFilingStatusTable)

const char* const kFederalTaxTable[] = {"FIT",        "SS_ER",       "SS_EE",      "MED_ER",
                                        "MED_EE",     "FUTA",        "AEIC",       "SS_ER_TIPS",
                                        "SS_EE_TIPS", "MED_ER_TIPS", "MED_EE_TIPS"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, FederalTax, OEFederalTax, 0, kFederalTaxTable)

const char* const kFederalTaxPaymentFrequencyTable[] = {"QTRLY", "MONTHLY", "SEMIWKLY", "DAILY"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, FederalTaxPaymentFrequency, OEFederalTaxPaymentFrequency, 0,
                kFederalTaxPaymentFrequencyTable)

const char* const kFederalW4FilingYearTable[] = {"", "2019ORBEFORE", "2020ANDLATER"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, FederalW4FilingYear, OEFederalW4FilingYear, 0,
                kFederalW4FilingYearTable)

const char* const kGuidelineModeTable[] = {"PENDING_ENROLLMENT", "ACTIVE", "CANCELLED", "PENDING_SETUP"};
unsigned short OEPayrollDataConversion::StringToGuidelineMode(const char* text, OEGLMode& value) {
    return KeywordToEnum(text, value, 0, 3, kGuidelineModeTable);
}

const char* const kHealthCareLevelTable[] = {"EMPLOYEE", "SPOUSE", "DEPENDENTS"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, HealthCareLevel, OEHealthCareLevel, 0, kHealthCareLevelTable)

const char* const kHealthCareProviderTable[] = {"EMPLOYEE", "COMPANY"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, HealthCareProvider, OEHealthCareProvider, 0,
                kHealthCareProviderTable)

const char* const kPayCheckTypeTable[] = {"PAYCHK", "YTDADJ"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, PayCheckType, OEPayCheckType, 0, kPayCheckTypeTable)

const char* const kPayTypeTable[] = {"REG", "SICK", "VAC"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, PayType, OEPayType, 0, kPayTypeTable)

const char* const kPayrollFrequencyTable[] = {"DAILY",   "WEEKLY",    "BIWEEKLY", "SEMIMONTHLY",
                                              "MONTHLY", "QUARTERLY", "YEARLY"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, PayrollFrequency, OEPayrollFrequency, 0, kPayrollFrequencyTable)

const char* const kPayrollItemSpecialTypeTable[] = {
    "COMCARE",     "COSSEC",     "EEMCARE",   "EESSEC",   "FEDTAX", "FUTA",   "SALARY",
    "SICK_SALARY", "VAC_SALARY", "SICK_HRLY", "VAC_HRLY", "AEIC",   "DIRDEP", "WORKER_COMP"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, PayrollItemSpecialType, OEPayrollItemSpecialType, 0,
                kPayrollItemSpecialTypeTable)

const char* const kPayrollTestingTypeTable[] = {"ACH", "TAX", "Y"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, PayrollTestingType, OEPayrollTestingType, 0,
                kPayrollTestingTypeTable)

const char* const kPayrollTxTypeTable[] = {"CARRYOVER", "PRIORPMT", "LIABADJ",    "LIABCHK",
                                           "REFUND",    "DDRETURN", "DDREVERSAL", "FUNDSTRANSFER"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, PayrollTxType, OEPayrollTxType, 0, kPayrollTxTypeTable)

const char* const kPayrollTypeTable[] = {"REG", "AGRI", "MSQE", "HOUSEHOLD"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, PayrollType, OEPayrollType, 0, kPayrollTypeTable)

const char* const kStateTaxTable[] = {"SIT", "SUI_ER", "SUI_EE", "SDI_ER", "SDI_EE"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, StateTax, OEStateTax, 0, kStateTaxTable)

const char* const kTaxFormLineTable[] = {
    "NONE",         "COMP",      "NONTAXSICK",    "OTHER",     "TIPS",        "DPDNTCARE", "SEC457",
    "NONQUALPLAN",  "FRNGBNFTS", "OTHMVEXP",      "401K",      "403B",        "408K",      "457B",
    "501C",         "LTAX1",     "LTAX2",         "QUALMVEX",  "MEDSAVING",   "SIMPLE",    "ADOPTION",
    "DPDNTCARE_CO", "LTAX_CO",   "GROUPTERMLIFE", "ALLOCTIPS", "125_MEDCARE", "125_POP",   "TTT1",
    "SEC_LOCAL",    "TTT3",      "ROTH401K",      "ROTH403B",  "EELOCTAX",    "TTT7",      "TTT8",
    "TTT9",         "TTT10",     "TTT11",         "TTT12",     "TTT13",       "TTT14",     "TTT15",
    "TTT16",        "TTT17",     "TTT18",         "TTT19",     "TTT20",       "TTT21",     "TTT22",
    "TTT23",        "TTT24",     "TTT25",         "TTT26",     "TTT27",       "TTT28",     "TTT29",
    "TTT30",        "TTT31",     "TTT32",         "TTT33",     "TTT34",       "TTT35",     "TTT36",
    "TTT37",        "TTT38",     "TTT39",         "TTT40",     "TTT41",       "TTT42",     "TTT43",
    "TTT44",        "TTT45",     "TTT46"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, TaxFormLine, OETaxFormLine, 0, kTaxFormLineTable)

const char* const kTaxPaymentTypeTable[] = {"LIAB", "PMT"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, TaxPaymentType, OETaxPaymentType, 0, kTaxPaymentTypeTable)

const char* const kTaxServiceModeTable[] = {"NO", "APPLIED", "ACTIVE", "TERMINATED", "VERIFIED", "NO"};
OE_KEYWORD_PAIR(OEPayrollDataConversion, TaxServiceMode, OETaxServiceMode, 0, kTaxServiceModeTable)
