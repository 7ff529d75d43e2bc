// OEPayrollDataConversion: the payroll enumerations, amounts and date-times, with the same
// rules as OEDataConversion.
#ifndef OESDK_FOUNDATION_OEPAYROLLDATACONV_H
#define OESDK_FOUNDATION_OEPAYROLLDATACONV_H

#include "oeexport.h"
#include "foundation/oedataconv.h"
#include "foundation/oepayrollamount.h"
#include "foundation/oepayrollenums.h"

class OE_API OEPayrollDataConversion : public OEDataConversion {
public:
    // "^@~*" and "__OFX_EMPTY_STRING__" set the empty flag; any other text is a date-time.
    static unsigned short StringToPayrollDateTime(const char* text, OEPayrollDateTime& value);
    static unsigned short PayrollDateTimeToString(const OEPayrollDateTime& value, OEString& out);
    // See OEPayrollAmount::Assign.
    static unsigned short StringToPayrollAmount(const char* text, OEPayrollAmount& value);
    static unsigned short PayrollAmountToString(const OEPayrollAmount& value, OEString& out);

    // One pair per enumeration (OEGLMode is only ever read).
    static unsigned short AccrualPeriodToString(OEAccrualPeriod value, OEString& out);
    static unsigned short StringToAccrualPeriod(const char* text, OEAccrualPeriod& value);
    static unsigned short BenefitTypeToString(OEBenefitType value, OEString& out);
    static unsigned short StringToBenefitType(const char* text, OEBenefitType& value);
    static unsigned short CalculationTypeToString(OECalculationType value, OEString& out);
    static unsigned short StringToCalculationType(const char* text, OECalculationType& value);
    static unsigned short DirectDepositModeToString(OEDirectDepositMode value, OEString& out);
    static unsigned short StringToDirectDepositMode(const char* text, OEDirectDepositMode& value);
    static unsigned short EmpSeasonalTypeToString(OESeasonalType value, OEString& out);
    static unsigned short StringToEmpSeasonalType(const char* text, OESeasonalType& value);
    static unsigned short EmployeeGenderToString(OEEmployeeGender value, OEString& out);
    static unsigned short StringToEmployeeGender(const char* text, OEEmployeeGender& value);
    static unsigned short EmployeeTypeToString(OEEmployeeType value, OEString& out);
    static unsigned short StringToEmployeeType(const char* text, OEEmployeeType& value);
    static unsigned short FederalFilingStatusToString(OEFederalFilingStatus value, OEString& out);
    static unsigned short StringToFederalFilingStatus(const char* text, OEFederalFilingStatus& value);
    static unsigned short FederalTaxToString(OEFederalTax value, OEString& out);
    static unsigned short StringToFederalTax(const char* text, OEFederalTax& value);
    static unsigned short FederalTaxPaymentFrequencyToString(OEFederalTaxPaymentFrequency value,
                                                             OEString& out);
    static unsigned short StringToFederalTaxPaymentFrequency(const char* text,
                                                             OEFederalTaxPaymentFrequency& value);
    static unsigned short FederalW4FilingYearToString(OEFederalW4FilingYear value, OEString& out);
    static unsigned short StringToFederalW4FilingYear(const char* text, OEFederalW4FilingYear& value);
    static unsigned short StringToGuidelineMode(const char* text, OEGLMode& value);
    static unsigned short HealthCareLevelToString(OEHealthCareLevel value, OEString& out);
    static unsigned short StringToHealthCareLevel(const char* text, OEHealthCareLevel& value);
    static unsigned short HealthCareProviderToString(OEHealthCareProvider value, OEString& out);
    static unsigned short StringToHealthCareProvider(const char* text, OEHealthCareProvider& value);
    static unsigned short PayCheckTypeToString(OEPayCheckType value, OEString& out);
    static unsigned short StringToPayCheckType(const char* text, OEPayCheckType& value);
    static unsigned short PayTypeToString(OEPayType value, OEString& out);
    static unsigned short StringToPayType(const char* text, OEPayType& value);
    static unsigned short PayrollFrequencyToString(OEPayrollFrequency value, OEString& out);
    static unsigned short StringToPayrollFrequency(const char* text, OEPayrollFrequency& value);
    static unsigned short PayrollItemSpecialTypeToString(OEPayrollItemSpecialType value, OEString& out);
    static unsigned short StringToPayrollItemSpecialType(const char* text, OEPayrollItemSpecialType& value);
    static unsigned short PayrollTestingTypeToString(OEPayrollTestingType value, OEString& out);
    static unsigned short StringToPayrollTestingType(const char* text, OEPayrollTestingType& value);
    static unsigned short PayrollTxTypeToString(OEPayrollTxType value, OEString& out);
    static unsigned short StringToPayrollTxType(const char* text, OEPayrollTxType& value);
    static unsigned short PayrollTypeToString(OEPayrollType value, OEString& out);
    static unsigned short StringToPayrollType(const char* text, OEPayrollType& value);
    static unsigned short StateTaxToString(OEStateTax value, OEString& out);
    static unsigned short StringToStateTax(const char* text, OEStateTax& value);
    static unsigned short TaxFormLineToString(OETaxFormLine value, OEString& out);
    static unsigned short StringToTaxFormLine(const char* text, OETaxFormLine& value);
    static unsigned short TaxPaymentTypeToString(OETaxPaymentType value, OEString& out);
    static unsigned short StringToTaxPaymentType(const char* text, OETaxPaymentType& value);
    static unsigned short TaxServiceModeToString(OETaxServiceMode value, OEString& out);
    static unsigned short StringToTaxServiceMode(const char* text, OETaxServiceMode& value);
};

#endif
