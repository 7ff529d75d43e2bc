#include "foundation/oepayrolldataconv.h"

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
unsigned short OEPayrollDataConversion::AccrualPeriodToString(OEAccrualPeriod value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kAccrualPeriodTable);
}
unsigned short OEPayrollDataConversion::StringToAccrualPeriod(const char* text, OEAccrualPeriod& value) {
    return KeywordToEnum(text, value, 0, 2, kAccrualPeriodTable);
}

const char* const kBenefitTypeTable[] = {"BENEFITNONE"};
unsigned short OEPayrollDataConversion::BenefitTypeToString(OEBenefitType value, OEString& out) {
    return KeywordToString(value, out, 0, 0, kBenefitTypeTable);
}
unsigned short OEPayrollDataConversion::StringToBenefitType(const char* text, OEBenefitType& value) {
    return KeywordToEnum(text, value, 0, 0, kBenefitTypeTable);
}

const char* const kCalculationTypeTable[] = {"FLATRATE", "PCTGROSS", "PCTNET", "QTY", "PCTQTY", "TAXTABLE"};
unsigned short OEPayrollDataConversion::CalculationTypeToString(OECalculationType value, OEString& out) {
    return KeywordToString(value, out, 0, 5, kCalculationTypeTable);
}
unsigned short OEPayrollDataConversion::StringToCalculationType(const char* text, OECalculationType& value) {
    return KeywordToEnum(text, value, 0, 5, kCalculationTypeTable);
}

const char* const kDirectDepositModeTable[] = {"NO",         "APPLIED",  "ACTIVE",
                                               "TERMINATED", "VERIFIED", "PENDING_ENROLLMENT"};
unsigned short OEPayrollDataConversion::DirectDepositModeToString(OEDirectDepositMode value, OEString& out) {
    return KeywordToString(value, out, 0, 5, kDirectDepositModeTable);
}
unsigned short OEPayrollDataConversion::StringToDirectDepositMode(const char* text,
                                                                  OEDirectDepositMode& value) {
    return KeywordToEnum(text, value, 0, 5, kDirectDepositModeTable);
}

const char* const kEmpSeasonalTypeTable[] = {"UNKNOWN", "SEASONAL", "NONSEASONAL"};
unsigned short OEPayrollDataConversion::EmpSeasonalTypeToString(OESeasonalType value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kEmpSeasonalTypeTable);
}
unsigned short OEPayrollDataConversion::StringToEmpSeasonalType(const char* text, OESeasonalType& value) {
    return KeywordToEnum(text, value, 0, 2, kEmpSeasonalTypeTable);
}

const char* const kEmployeeGenderTable[] = {"UNKNOWN", "FEMALE", "MALE"};
unsigned short OEPayrollDataConversion::EmployeeGenderToString(OEEmployeeGender value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kEmployeeGenderTable);
}
unsigned short OEPayrollDataConversion::StringToEmployeeGender(const char* text, OEEmployeeGender& value) {
    return KeywordToEnum(text, value, 0, 2, kEmployeeGenderTable);
}

const char* const kEmployeeTypeTable[] = {"REG", "OFFICER", "STATUTORY", "OWNER", "REP"};
unsigned short OEPayrollDataConversion::EmployeeTypeToString(OEEmployeeType value, OEString& out) {
    return KeywordToString(value, out, 0, 4, kEmployeeTypeTable);
}
unsigned short OEPayrollDataConversion::StringToEmployeeType(const char* text, OEEmployeeType& value) {
    return KeywordToEnum(text, value, 0, 4, kEmployeeTypeTable);
}

const char* const kFederalFilingStatusTable[] = {"SINGLE", "MARRIED", "HEADOFHOUSE", "HEADOFHOUSE_W42020"};
unsigned short OEPayrollDataConversion::FederalFilingStatusToString(OEFederalFilingStatus value,
                                                                    OEString& out) {
    return KeywordToString(value, out, 0, 3, kFederalFilingStatusTable);
}
unsigned short OEPayrollDataConversion::StringToFederalFilingStatus(const char* text,
                                                                    OEFederalFilingStatus& value) {
    return KeywordToEnum(text, value, 0, 3, kFederalFilingStatusTable);
}

const char* const kFederalTaxTable[] = {"FIT",        "SS_ER",       "SS_EE",      "MED_ER",
                                        "MED_EE",     "FUTA",        "AEIC",       "SS_ER_TIPS",
                                        "SS_EE_TIPS", "MED_ER_TIPS", "MED_EE_TIPS"};
unsigned short OEPayrollDataConversion::FederalTaxToString(OEFederalTax value, OEString& out) {
    return KeywordToString(value, out, 0, 10, kFederalTaxTable);
}
unsigned short OEPayrollDataConversion::StringToFederalTax(const char* text, OEFederalTax& value) {
    return KeywordToEnum(text, value, 0, 10, kFederalTaxTable);
}

const char* const kFederalTaxPaymentFrequencyTable[] = {"QTRLY", "MONTHLY", "SEMIWKLY", "DAILY"};
unsigned short OEPayrollDataConversion::FederalTaxPaymentFrequencyToString(OEFederalTaxPaymentFrequency value,
                                                                           OEString& out) {
    return KeywordToString(value, out, 0, 3, kFederalTaxPaymentFrequencyTable);
}
unsigned short
OEPayrollDataConversion::StringToFederalTaxPaymentFrequency(const char* text,
                                                            OEFederalTaxPaymentFrequency& value) {
    return KeywordToEnum(text, value, 0, 3, kFederalTaxPaymentFrequencyTable);
}

const char* const kFederalW4FilingYearTable[] = {"", "2019ORBEFORE", "2020ANDLATER"};
unsigned short OEPayrollDataConversion::FederalW4FilingYearToString(OEFederalW4FilingYear value,
                                                                    OEString& out) {
    return KeywordToString(value, out, 0, 2, kFederalW4FilingYearTable);
}
unsigned short OEPayrollDataConversion::StringToFederalW4FilingYear(const char* text,
                                                                    OEFederalW4FilingYear& value) {
    return KeywordToEnum(text, value, 0, 2, kFederalW4FilingYearTable);
}

const char* const kGuidelineModeTable[] = {"PENDING_ENROLLMENT", "ACTIVE", "CANCELLED", "PENDING_SETUP"};
unsigned short OEPayrollDataConversion::StringToGuidelineMode(const char* text, OEGLMode& value) {
    return KeywordToEnum(text, value, 0, 3, kGuidelineModeTable);
}

const char* const kHealthCareLevelTable[] = {"EMPLOYEE", "SPOUSE", "DEPENDENTS"};
unsigned short OEPayrollDataConversion::HealthCareLevelToString(OEHealthCareLevel value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kHealthCareLevelTable);
}
unsigned short OEPayrollDataConversion::StringToHealthCareLevel(const char* text, OEHealthCareLevel& value) {
    return KeywordToEnum(text, value, 0, 2, kHealthCareLevelTable);
}

const char* const kHealthCareProviderTable[] = {"EMPLOYEE", "COMPANY"};
unsigned short OEPayrollDataConversion::HealthCareProviderToString(OEHealthCareProvider value,
                                                                   OEString& out) {
    return KeywordToString(value, out, 0, 1, kHealthCareProviderTable);
}
unsigned short OEPayrollDataConversion::StringToHealthCareProvider(const char* text,
                                                                   OEHealthCareProvider& value) {
    return KeywordToEnum(text, value, 0, 1, kHealthCareProviderTable);
}

const char* const kPayCheckTypeTable[] = {"PAYCHK", "YTDADJ"};
unsigned short OEPayrollDataConversion::PayCheckTypeToString(OEPayCheckType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kPayCheckTypeTable);
}
unsigned short OEPayrollDataConversion::StringToPayCheckType(const char* text, OEPayCheckType& value) {
    return KeywordToEnum(text, value, 0, 1, kPayCheckTypeTable);
}

const char* const kPayTypeTable[] = {"REG", "SICK", "VAC"};
unsigned short OEPayrollDataConversion::PayTypeToString(OEPayType value, OEString& out) {
    return KeywordToString(value, out, 0, 2, kPayTypeTable);
}
unsigned short OEPayrollDataConversion::StringToPayType(const char* text, OEPayType& value) {
    return KeywordToEnum(text, value, 0, 2, kPayTypeTable);
}

const char* const kPayrollFrequencyTable[] = {"DAILY",   "WEEKLY",    "BIWEEKLY", "SEMIMONTHLY",
                                              "MONTHLY", "QUARTERLY", "YEARLY"};
unsigned short OEPayrollDataConversion::PayrollFrequencyToString(OEPayrollFrequency value, OEString& out) {
    return KeywordToString(value, out, 0, 6, kPayrollFrequencyTable);
}
unsigned short OEPayrollDataConversion::StringToPayrollFrequency(const char* text,
                                                                 OEPayrollFrequency& value) {
    return KeywordToEnum(text, value, 0, 6, kPayrollFrequencyTable);
}

const char* const kPayrollItemSpecialTypeTable[] = {
    "COMCARE",     "COSSEC",     "EEMCARE",   "EESSEC",   "FEDTAX", "FUTA",   "SALARY",
    "SICK_SALARY", "VAC_SALARY", "SICK_HRLY", "VAC_HRLY", "AEIC",   "DIRDEP", "WORKER_COMP"};
unsigned short OEPayrollDataConversion::PayrollItemSpecialTypeToString(OEPayrollItemSpecialType value,
                                                                       OEString& out) {
    return KeywordToString(value, out, 0, 13, kPayrollItemSpecialTypeTable);
}
unsigned short OEPayrollDataConversion::StringToPayrollItemSpecialType(const char* text,
                                                                       OEPayrollItemSpecialType& value) {
    return KeywordToEnum(text, value, 0, 13, kPayrollItemSpecialTypeTable);
}

const char* const kPayrollTestingTypeTable[] = {"ACH", "TAX", "Y"};
unsigned short OEPayrollDataConversion::PayrollTestingTypeToString(OEPayrollTestingType value,
                                                                   OEString& out) {
    return KeywordToString(value, out, 0, 2, kPayrollTestingTypeTable);
}
unsigned short OEPayrollDataConversion::StringToPayrollTestingType(const char* text,
                                                                   OEPayrollTestingType& value) {
    return KeywordToEnum(text, value, 0, 2, kPayrollTestingTypeTable);
}

const char* const kPayrollTxTypeTable[] = {"CARRYOVER", "PRIORPMT", "LIABADJ",    "LIABCHK",
                                           "REFUND",    "DDRETURN", "DDREVERSAL", "FUNDSTRANSFER"};
unsigned short OEPayrollDataConversion::PayrollTxTypeToString(OEPayrollTxType value, OEString& out) {
    return KeywordToString(value, out, 0, 7, kPayrollTxTypeTable);
}
unsigned short OEPayrollDataConversion::StringToPayrollTxType(const char* text, OEPayrollTxType& value) {
    return KeywordToEnum(text, value, 0, 7, kPayrollTxTypeTable);
}

const char* const kPayrollTypeTable[] = {"REG", "AGRI", "MSQE", "HOUSEHOLD"};
unsigned short OEPayrollDataConversion::PayrollTypeToString(OEPayrollType value, OEString& out) {
    return KeywordToString(value, out, 0, 3, kPayrollTypeTable);
}
unsigned short OEPayrollDataConversion::StringToPayrollType(const char* text, OEPayrollType& value) {
    return KeywordToEnum(text, value, 0, 3, kPayrollTypeTable);
}

const char* const kStateTaxTable[] = {"SIT", "SUI_ER", "SUI_EE", "SDI_ER", "SDI_EE"};
unsigned short OEPayrollDataConversion::StateTaxToString(OEStateTax value, OEString& out) {
    return KeywordToString(value, out, 0, 4, kStateTaxTable);
}
unsigned short OEPayrollDataConversion::StringToStateTax(const char* text, OEStateTax& value) {
    return KeywordToEnum(text, value, 0, 4, kStateTaxTable);
}

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
unsigned short OEPayrollDataConversion::TaxFormLineToString(OETaxFormLine value, OEString& out) {
    return KeywordToString(value, out, 0, 72, kTaxFormLineTable);
}
unsigned short OEPayrollDataConversion::StringToTaxFormLine(const char* text, OETaxFormLine& value) {
    return KeywordToEnum(text, value, 0, 72, kTaxFormLineTable);
}

const char* const kTaxPaymentTypeTable[] = {"LIAB", "PMT"};
unsigned short OEPayrollDataConversion::TaxPaymentTypeToString(OETaxPaymentType value, OEString& out) {
    return KeywordToString(value, out, 0, 1, kTaxPaymentTypeTable);
}
unsigned short OEPayrollDataConversion::StringToTaxPaymentType(const char* text, OETaxPaymentType& value) {
    return KeywordToEnum(text, value, 0, 1, kTaxPaymentTypeTable);
}

const char* const kTaxServiceModeTable[] = {"NO", "APPLIED", "ACTIVE", "TERMINATED", "VERIFIED", "NO"};
unsigned short OEPayrollDataConversion::TaxServiceModeToString(OETaxServiceMode value, OEString& out) {
    return KeywordToString(value, out, 0, 5, kTaxServiceModeTable);
}
unsigned short OEPayrollDataConversion::StringToTaxServiceMode(const char* text, OETaxServiceMode& value) {
    return KeywordToEnum(text, value, 0, 5, kTaxServiceModeTable);
}
