#include "messages/oetrans.h"

#include "build/oebuilder.h"
#include "foundation/oeparsewarning.h"
#include "foundation/oethread.h"
#include "messages/oeaccount.h"
#include "messages/oebank.h"
#include "messages/oechallenge.h"
#include "messages/oeprofile.h"
#include "messages/oestmtend.h"
#include "messages/oeseclist.h"
#include "messages/oeinvest.h"
#include "messages/oesignon.h"

#include <cstdlib>
#include <cstring>
#include <vector>

namespace {

// The 52 inner requests a transaction wrapper knows, with their wrappers. The inner class of a
// row is made through the field row of the same tag below; a tag without one answers 4 until
// the change that brings its class adds the row.
struct InnerRow {
    OETagID m_inner;
    OETagID m_wrapper;
};
const InnerRow kInner[] = {
    {OETAG_ACCTINFORQ, OETAG_ACCTINFOTRNRQ},
    {OETAG_ACCTRQ, OETAG_ACCTTRNRQ},
    {OETAG_BANKMAILRQ, OETAG_BANKMAILTRNRQ},
    {OETAG_CCSTMTENDRQ, OETAG_CCSTMTENDTRNRQ},
    {OETAG_CCSTMTRQ, OETAG_CCSTMTTRNRQ},
    {OETAG_CHALLENGERQ, OETAG_CHALLENGETRNRQ},
    {OETAG_CHGUSERINFORQ, OETAG_CHGUSERINFOTRNRQ},
    {OETAG_ENROLLRQ, OETAG_ENROLLTRNRQ},
    {OETAG_GETMIMERQ, OETAG_GETMIMETRNRQ},
    {OETAG_INTERCANRQ, OETAG_INTERTRNRQ},
    {OETAG_INTERMODRQ, OETAG_INTERTRNRQ},
    {OETAG_INTERRQ, OETAG_INTERTRNRQ},
    {OETAG_INTRACANRQ, OETAG_INTRATRNRQ},
    {OETAG_INTRAMODRQ, OETAG_INTRATRNRQ},
    {OETAG_INTRARQ, OETAG_INTRATRNRQ},
    {OETAG_INVMAILRQ, OETAG_INVMAILTRNRQ},
    {OETAG_INVSTMTRQ, OETAG_INVSTMTTRNRQ},
    {OETAG_K_PAYROLLENROLLRQ, OETAG_K_PAYROLLENROLLTRNRQ},
    {OETAG_K_PAYROLLRQ, OETAG_K_PAYROLLTRNRQ},
    {OETAG_KEST_BRANDRQ, OETAG_KEST_BRANDTRNRQ},
    {OETAG_KEST_CLIENTLOGRQ, OETAG_KEST_CLIENTLOGTRNRQ},
    {OETAG_KEST_CUUSAGELOGRQ, OETAG_KEST_CUUSAGELOGTRNRQ},
    {OETAG_KEST_FIUSAGELOGRQ, OETAG_KEST_FIUSAGELOGTRNRQ},
    {OETAG_KEST_MKTTIERRQ, OETAG_KEST_MKTTIERTRNRQ},
    {OETAG_KEST_SURVEYRQ, OETAG_KEST_SURVEYTRNRQ},
    {OETAG_KEST_SWREGRQ, OETAG_KEST_SWREGTRNRQ},
    {OETAG_MAILRQ, OETAG_MAILTRNRQ},
    {OETAG_PAYEEDELRQ, OETAG_PAYEETRNRQ},
    {OETAG_PAYEEMODRQ, OETAG_PAYEETRNRQ},
    {OETAG_PAYEERQ, OETAG_PAYEETRNRQ},
    {OETAG_PINCHRQ, OETAG_PINCHTRNRQ},
    {OETAG_PMTCANCRQ, OETAG_PMTTRNRQ},
    {OETAG_PMTINQRQ, OETAG_PMTINQTRNRQ},
    {OETAG_PMTMAILRQ, OETAG_PMTMAILTRNRQ},
    {OETAG_PMTMODRQ, OETAG_PMTTRNRQ},
    {OETAG_PMTRQ, OETAG_PMTTRNRQ},
    {OETAG_PROFRQ, OETAG_PROFTRNRQ},
    {OETAG_RECINTERCANRQ, OETAG_RECINTERTRNRQ},
    {OETAG_RECINTERMODRQ, OETAG_RECINTERTRNRQ},
    {OETAG_RECINTERRQ, OETAG_RECINTERTRNRQ},
    {OETAG_RECINTRACANRQ, OETAG_RECINTRATRNRQ},
    {OETAG_RECINTRAMODRQ, OETAG_RECINTRATRNRQ},
    {OETAG_RECINTRARQ, OETAG_RECINTRATRNRQ},
    {OETAG_RECPMTCANCRQ, OETAG_RECPMTTRNRQ},
    {OETAG_RECPMTMODRQ, OETAG_RECPMTTRNRQ},
    {OETAG_RECPMTRQ, OETAG_RECPMTTRNRQ},
    {OETAG_SECLISTRQ, OETAG_SECLISTTRNRQ},
    {OETAG_STMTENDRQ, OETAG_STMTENDTRNRQ},
    {OETAG_STMTRQ, OETAG_STMTTRNRQ},
    {OETAG_STPCHKRQ, OETAG_STPCHKTRNRQ},
    {OETAG_WIRECANRQ, OETAG_WIRETRNRQ},
    {OETAG_WIRERQ, OETAG_WIRETRNRQ},
};
static_assert(sizeof(kInner) / sizeof(kInner[0]) == 52, "the inner request map has 52 entries");

// Required inner request per wrapper: one tag, or up to three combined by exclusive or (so one or
// all three present passes; kept as it is).
struct RequiredInner {
    OETagID m_wrapper;
    OETagID m_a, m_b, m_c;
};
const RequiredInner kRequiredInner[] = {
    {OETAG_INTERTRNRQ, OETAG_INTERRQ, OETAG_INTERMODRQ, OETAG_INTERCANRQ},
    {OETAG_INTRATRNRQ, OETAG_INTRARQ, OETAG_INTRAMODRQ, OETAG_INTRACANRQ},
    {OETAG_RECINTERTRNRQ, OETAG_RECINTERRQ, OETAG_RECINTERMODRQ, OETAG_RECINTERCANRQ},
    {OETAG_RECINTRATRNRQ, OETAG_RECINTRARQ, OETAG_RECINTRAMODRQ, OETAG_RECINTRACANRQ},
    {OETAG_PAYEETRNRQ, OETAG_PAYEERQ, OETAG_PAYEEMODRQ, OETAG_PAYEEDELRQ},
    {OETAG_PMTTRNRQ, OETAG_PMTRQ, OETAG_PMTMODRQ, OETAG_PMTCANCRQ},
    {OETAG_RECPMTTRNRQ, OETAG_RECPMTRQ, OETAG_RECPMTMODRQ, OETAG_RECPMTCANCRQ},
    {OETAG_WIRETRNRQ, OETAG_WIRERQ, OETAG_WIRECANRQ, OETAG_NONE},
    {OETAG_MULTIINTERTRNRQ, OETAG_INTERRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_GETMIMETRNRQ, OETAG_GETMIMERQ, OETAG_NONE, OETAG_NONE},
    {OETAG_BANKMAILTRNRQ, OETAG_BANKMAILRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_CCSTMTENDTRNRQ, OETAG_CCSTMTENDRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_CCSTMTTRNRQ, OETAG_CCSTMTRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_STMTTRNRQ, OETAG_STMTRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_STMTENDTRNRQ, OETAG_STMTENDRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_STPCHKTRNRQ, OETAG_STPCHKRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_INVMAILTRNRQ, OETAG_INVMAILRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_INVSTMTTRNRQ, OETAG_INVSTMTRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_MAILTRNRQ, OETAG_MAILRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_PMTINQTRNRQ, OETAG_PMTINQRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_PMTMAILTRNRQ, OETAG_PMTMAILRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_SECLISTTRNRQ, OETAG_SECLISTRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_KEST_BRANDTRNRQ, OETAG_KEST_BRANDRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_KEST_MKTTIERTRNRQ, OETAG_KEST_MKTTIERRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_KEST_CLIENTLOGTRNRQ, OETAG_KEST_CLIENTLOGRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_KEST_CUUSAGELOGTRNRQ, OETAG_KEST_CUUSAGELOGRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_KEST_FIUSAGELOGTRNRQ, OETAG_KEST_FIUSAGELOGRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_KEST_SURVEYTRNRQ, OETAG_KEST_SURVEYRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_KEST_SWREGTRNRQ, OETAG_KEST_SWREGRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_K_PAYROLLENROLLTRNRQ, OETAG_K_PAYROLLENROLLRQ, OETAG_NONE, OETAG_NONE},
    {OETAG_K_PAYROLLTRNRQ, OETAG_K_PAYROLLRQ, OETAG_NONE, OETAG_NONE},
};

const RequiredInner* FindRequiredInner(OETagID wrapper) {
    for (const RequiredInner& r : kRequiredInner)
        if (r.m_wrapper == wrapper) return &r;
    return nullptr;
}

// The required inner aggregates of a wrapper present: the one tag, or the exclusive or of the two
// or three (of their responses on the response side).
unsigned short RequiredInnerPresent(const OEDataObj& wrapper, const RequiredInner& r, bool response) {
    auto present = [&](OETagID tag) { return wrapper.ValidateTag(response ? OEResponseTagOf(tag) : tag); };
    if (r.m_b == OETAG_NONE) return present(r.m_a);
    unsigned short x = present(r.m_a) ^ present(r.m_b);
    if (r.m_c != OETAG_NONE) x ^= present(r.m_c);
    return x;
}

// ---- transaction request wrapper ----
// Valid rows: the four elements, then all 52 inner requests (built once, below). An inner request
// whose class is not part of the library yet has no field row: NewInner answers 4 for it.
const OETagRow kTransRqRequired[] = {{OETAG_TRNUID, OEVM_ALL, 0}};
const OEFieldRow kTransRqFields[] = {
    {OETAG_TRNUID, OEFK_TEXT, OE_MEMBER(OETransRq, m_trnUid), nullptr, nullptr},
    {OETAG_SYNCCOMPLETEINFO, OEFK_BOOL, OE_MEMBER(OETransRq, m_syncCompleteInfo), nullptr, nullptr},
    {OETAG_CLTCOOKIE, OEFK_TEXT, OE_MEMBER(OETransRq, m_cltCookie), nullptr, nullptr},
    {OETAG_TAN, OEFK_TEXT, OE_MEMBER(OETransRq, m_tan), nullptr, nullptr},
    {OETAG_STMTRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewBankStatementRq)},
    {OETAG_CCSTMTRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewCCStatementRq)},
    {OETAG_PINCHRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewPinChangeRq)},
    {OETAG_STMTENDRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewStatementEndRq)},
    {OETAG_CCSTMTENDRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewCCStatementEndRq)},
    {OETAG_CHALLENGERQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewChallengeRq)},
    {OETAG_PROFRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewProfileRq)},
    {OETAG_SECLISTRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewSecListRq)},
    {OETAG_INVSTMTRQ, OEFK_CHILD, OE_MEMBER(OETransRq, m_actual), nullptr, OE_MAKE(NewInvStmtRq)},
};

// ---- transaction response wrapper ----
// Valid rows: the four elements, then the responses of all 52 inner requests.
const OETagRow kTransRsRequired[] = {{OETAG_TRNUID, OEVM_ALL, 0}, {OETAG_STATUS, OEVM_ALL, 0}};
const OEFieldRow kTransRsFields[] = {
    {OETAG_TRNUID, OEFK_TEXT, OE_MEMBER(OETransRs, m_trnUid), nullptr, nullptr},
    {OETAG_STATUS, OEFK_CHILD, OE_MEMBER(OETransRs, m_status), nullptr, OE_MAKE(NewStatus)},
    {OETAG_CLTCOOKIE, OEFK_TEXT, OE_MEMBER(OETransRs, m_cltCookie), nullptr, nullptr},
    {OETAG_WARNING, OEFK_CHILD, OE_MEMBER(OETransRs, m_warning), nullptr, OE_MAKE(NewWarning)},
    {OETAG_STMTRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewBankStatementRs)},
    {OETAG_CCSTMTRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewCCStatementRs)},
    {OETAG_PINCHRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewPinChangeRs)},
    {OETAG_STMTENDRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewStatementEndRs)},
    {OETAG_CCSTMTENDRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewCCStatementEndRs)},
    {OETAG_CHALLENGERS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewChallengeRs)},
    {OETAG_PROFRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewProfileRs)},
    {OETAG_SECLISTRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewSecListRs)},
    {OETAG_INVSTMTRS, OEFK_CHILD, OE_MEMBER(OETransRs, m_actual), nullptr, OE_MAKE(NewInvStmtRs)},
};

// ---- STATUS ----
const OETagRow kStatusValid[] = {{OETAG_CODE, OEVM_ALL, 0},
                                 {OETAG_SEVERITY, OEVM_ALL, 0},
                                 {OETAG_MESSAGE, OEVM_V1, 0},
                                 {OETAG_MESSAGE2, OEVM_NOTV1, 0}};
const OETagRow kStatusRequired[] = {{OETAG_CODE, OEVM_ALL, 0}, {OETAG_SEVERITY, OEVM_ALL, 0}};
const OEFieldRow kStatusFields[] = {
    {OETAG_CODE, OEFK_SLONG, OE_MEMBER(OEStatus, m_code), nullptr, nullptr},
    {OETAG_SEVERITY, OEFK_ENUM, OE_MEMBER(OEStatus, m_severity), &OEKW_SEVERITY, nullptr},
    {OETAG_MESSAGE, OEFK_TEXT, OE_MEMBER(OEStatus, m_message), nullptr, nullptr},
    {OETAG_MESSAGE2, OEFK_TEXT, OE_MEMBER(OEStatus, m_message2), nullptr, nullptr},
};

// ---- WARNING ----
const OETagRow kWarningValid[] = {{OETAG_TITLE, OEVM_ALL, 0}, {OETAG_MSG, OEVM_ALL, 0}};
const OEFieldRow kWarningFields[] = {
    {OETAG_TITLE, OEFK_TEXT, OE_MEMBER(OEWarning, m_title), nullptr, nullptr},
    {OETAG_MSG, OEFK_TEXT, OE_MEMBER(OEWarning, m_msg), nullptr, nullptr},
};

// ---- synchronisation wrappers ----
// The transaction wrappers that a synchronisation aggregate may repeat.
const OETagID kSyncWrappers[] = {
    OETAG_ACCTTRNRQ,      OETAG_BANKMAILTRNRQ, OETAG_CHGUSERINFOTRNRQ, OETAG_INTERTRNRQ,   OETAG_INTRATRNRQ,
    OETAG_INVMAILTRNRQ,   OETAG_MAILTRNRQ,     OETAG_PAYEETRNRQ,       OETAG_PMTMAILTRNRQ, OETAG_PMTTRNRQ,
    OETAG_RECINTERTRNRQ,  OETAG_RECINTRATRNRQ, OETAG_RECPMTTRNRQ,      OETAG_STPCHKTRNRQ,  OETAG_WIRETRNRQ,
    OETAG_K_PAYROLLTRNRQ, OETAG_K_EFILETRNRQ};

#define OE_SYNC_WRAPPER_ROWS(S)                                                                              \
    {OETAG_ACCTTRN##S, OEVM_ALL, 0}, {OETAG_BANKMAILTRN##S, OEVM_ALL, 0},                                    \
        {OETAG_CHGUSERINFOTRN##S, OEVM_ALL, 0}, {OETAG_INTERTRN##S, OEVM_ALL, 0},                            \
        {OETAG_INTRATRN##S, OEVM_ALL, 0}, {OETAG_INVMAILTRN##S, OEVM_ALL, 0},                                \
        {OETAG_MAILTRN##S, OEVM_ALL, 0}, {OETAG_PAYEETRN##S, OEVM_ALL, 0},                                   \
        {OETAG_PMTMAILTRN##S, OEVM_ALL, 0}, {OETAG_PMTTRN##S, OEVM_ALL, 0},                                  \
        {OETAG_RECINTERTRN##S, OEVM_ALL, 0}, {OETAG_RECINTRATRN##S, OEVM_ALL, 0},                            \
        {OETAG_RECPMTTRN##S, OEVM_ALL, 0}, {OETAG_STPCHKTRN##S, OEVM_ALL, 0},                                \
        {OETAG_WIRETRN##S, OEVM_ALL, 0}, {OETAG_K_PAYROLLTRN##S, OEVM_ALL, 0}, {                             \
        OETAG_K_EFILETRN##S, OEVM_ALL, 0                                                                     \
    }

const OETagRow kSyncRqValid[] = {{OETAG_TOKEN, OEVM_ALL, 0},           {OETAG_TOKEN2, OEVM_ALL, 0},
                                 {OETAG_TOKENONLY, OEVM_ALL, 0},       {OETAG_REFRESH, OEVM_ALL, 0},
                                 {OETAG_REJECTIFMISSING, OEVM_ALL, 0}, {OETAG_INCIMAGES, OEVM_ALL, 0},
                                 {OETAG_USEHTML, OEVM_ALL, 0},         {OETAG_SYNCERROR, OEVM_ALL, 0},
                                 {OETAG_KEST_REFRESH, OEVM_ALL, 0},    {OETAG_KEST_SYNCERROR, OEVM_ALL, 0},
                                 {OETAG_BANKACCTFROM, OEVM_ALL, 0},    {OETAG_CCACCTFROM, OEVM_ALL, 0},
                                 {OETAG_INVACCTFROM, OEVM_ALL, 0},     OE_SYNC_WRAPPER_ROWS(RQ)};
const OETagRow kSyncRqRequired[] = {{OETAG_REJECTIFMISSING, OEVM_ALL, 0}};
const OEFieldRow kSyncRqFields[] = {
    {OETAG_TOKEN, OEFK_TEXT, OE_MEMBER(OESyncRq, m_token), nullptr, nullptr},
    {OETAG_TOKEN2, OEFK_TEXT, OE_MEMBER(OESyncRq, m_token2), nullptr, nullptr},
    {OETAG_TOKENONLY, OEFK_BOOL, OE_MEMBER(OESyncRq, m_tokenOnly), nullptr, nullptr},
    {OETAG_REFRESH, OEFK_BOOL, OE_MEMBER(OESyncRq, m_refresh), nullptr, nullptr},
    {OETAG_REJECTIFMISSING, OEFK_BOOL, OE_MEMBER(OESyncRq, m_rejectIfMissing), nullptr, nullptr},
    {OETAG_INCIMAGES, OEFK_BOOL, OE_MEMBER(OESyncRq, m_incImages), nullptr, nullptr},
    {OETAG_USEHTML, OEFK_BOOL, OE_MEMBER(OESyncRq, m_useHtml), nullptr, nullptr},
    {OETAG_SYNCERROR, OEFK_ULONG, OE_MEMBER(OESyncRq, m_syncError), nullptr, nullptr},
    {OETAG_KEST_REFRESH, OEFK_BOOL, OE_MEMBER(OESyncRq, m_kestRefresh), nullptr, nullptr},
    {OETAG_KEST_SYNCERROR, OEFK_ULONG, OE_MEMBER(OESyncRq, m_kestSyncError), nullptr, nullptr},
    {OETAG_BANKACCTFROM, OEFK_CHILD, OE_MEMBER(OESyncRq, m_account), nullptr, OE_MAKE(NewBankAccount)},
    {OETAG_CCACCTFROM, OEFK_CHILD, OE_MEMBER(OESyncRq, m_account), nullptr, OE_MAKE(NewCCAccount)},
};

const OETagRow kSyncRsValid[] = {{OETAG_TOKEN, OEVM_ALL, 0},
                                 {OETAG_TOKEN2, OEVM_ALL, 0},
                                 {OETAG_LOSTSYNC, OEVM_ALL, 0},
                                 {OETAG_SYNCERROR, OEVM_ALL, 0},
                                 {OETAG_TRNUID, OEVM_ALL, 0},
                                 {OETAG_KEST_REFRESH, OEVM_ALL, 0},
                                 {OETAG_KEST_SYNCERROR, OEVM_ALL, 0},
                                 {OETAG_BANKACCTFROM, OEVM_ALL, 0},
                                 {OETAG_CCACCTFROM, OEVM_ALL, 0},
                                 {OETAG_INVACCTFROM, OEVM_ALL, 0},
                                 {OETAG_K_PAYCHKNEXTID, OEVM_ALL, 0},
                                 {OETAG_K_PAYROLLTXNEXTID, OEVM_ALL, 0},
                                 {OETAG_K_EMPNEXTID, OEVM_ALL, 0},
                                 {OETAG_K_PITEMNEXTID, OEVM_ALL, 0},
                                 OE_SYNC_WRAPPER_ROWS(RS)};
const OEFieldRow kSyncRsFields[] = {
    {OETAG_TOKEN, OEFK_TEXT, OE_MEMBER(OESyncRs, m_token), nullptr, nullptr},
    {OETAG_TOKEN2, OEFK_TEXT, OE_MEMBER(OESyncRs, m_token2), nullptr, nullptr},
    {OETAG_LOSTSYNC, OEFK_BOOL, OE_MEMBER(OESyncRs, m_lostSync), nullptr, nullptr},
    {OETAG_SYNCERROR, OEFK_ULONG, OE_MEMBER(OESyncRs, m_syncError), nullptr, nullptr},
    {OETAG_TRNUID, OEFK_TEXT, OE_MEMBER(OESyncRs, m_trnUid), nullptr, nullptr},
    {OETAG_KEST_REFRESH, OEFK_BOOL, OE_MEMBER(OESyncRs, m_kestRefresh), nullptr, nullptr},
    {OETAG_KEST_SYNCERROR, OEFK_ULONG, OE_MEMBER(OESyncRs, m_kestSyncError), nullptr, nullptr},
    {OETAG_BANKACCTFROM, OEFK_CHILD, OE_MEMBER(OESyncRs, m_account), nullptr, OE_MAKE(NewBankAccount)},
    {OETAG_CCACCTFROM, OEFK_CHILD, OE_MEMBER(OESyncRs, m_account), nullptr, OE_MAKE(NewCCAccount)},
};

template <size_t NR, size_t NF>
OEAggregateDesc WrapperDesc(const std::vector<OETagRow>& valid, const OETagRow (&required)[NR],
                            const OEFieldRow (&fields)[NF]) {
    return OEAggregateDesc{OETAG_NONE,
                           valid.data(),
                           static_cast<unsigned short>(valid.size()),
                           required,
                           static_cast<unsigned short>(NR),
                           fields,
                           static_cast<unsigned short>(NF)};
}

const OEAggregateDesc& TransRqDesc() {
    static const std::vector<OETagRow> valid = [] {
        std::vector<OETagRow> rows = {{OETAG_TRNUID, OEVM_ALL, 0},
                                      {OETAG_SYNCCOMPLETEINFO, OEVM_ALL, 0},
                                      {OETAG_CLTCOOKIE, OEVM_ALL, 0},
                                      {OETAG_TAN, OEVM_ALL, 0}};
        for (const InnerRow& r : kInner) rows.push_back(OETagRow{r.m_inner, OEVM_ALL, 0});
        return rows;
    }();
    static const OEAggregateDesc desc = WrapperDesc(valid, kTransRqRequired, kTransRqFields);
    return desc;
}

const OEAggregateDesc& TransRsDesc() {
    static const std::vector<OETagRow> valid = [] {
        std::vector<OETagRow> rows = {{OETAG_TRNUID, OEVM_ALL, 0},
                                      {OETAG_STATUS, OEVM_ALL, 0},
                                      {OETAG_CLTCOOKIE, OEVM_ALL, 0},
                                      {OETAG_WARNING, OEVM_ALL, 0}};
        for (const InnerRow& r : kInner)
            if (OETagID rs = OEResponseTagOf(r.m_inner)) rows.push_back(OETagRow{rs, OEVM_ALL, 0});
        return rows;
    }();
    static const OEAggregateDesc desc = WrapperDesc(valid, kTransRsRequired, kTransRsFields);
    return desc;
}

// ---- MULTIINTERTRNRQ / MULTIINTERTRNRS ----
// A multiple wrapper has the plain wrapper's first rows (its elements, and STATUS and WARNING on
// the response side), then a list of inner aggregates made by the plain wrapper's creator for
// that tag. So INTERRQ / INTERRS become available here the moment the plain wrapper gets a row
// for them.
const unsigned short kWrapperOwnRows = 4;
static_assert(sizeof(kTransRqFields) / sizeof(kTransRqFields[0]) >= kWrapperOwnRows, "own rows");
static_assert(sizeof(kTransRsFields) / sizeof(kTransRsFields[0]) >= kWrapperOwnRows, "own rows");

template <size_t N> const OEFieldRow* InnerRowOf(const OEFieldRow (&rows)[N], OETagID tag) {
    for (const OEFieldRow& r : rows)
        if (r.m_tag == tag && r.m_kind == OEFK_CHILD) return &r;
    return nullptr;
}

OEDataObj* MakeInterRq(OEDataObjFactory* factory, unsigned short version) {
    const OEFieldRow* row = InnerRowOf(kTransRqFields, OETAG_INTERRQ);
    return row ? row->m_make(factory, version) : nullptr;
}
OEDataObj* MakeInterRs(OEDataObjFactory* factory, unsigned short version) {
    const OEFieldRow* row = InnerRowOf(kTransRsFields, OETAG_INTERRS);
    return row ? row->m_make(factory, version) : nullptr;
}

// The rows of a multiple wrapper: `own` (the plain wrapper's first rows), then `list`.
struct MultiTables {
    std::vector<OEFieldRow> m_fields;
    std::vector<OETagRow> m_valid;
    MultiTables(const OEFieldRow* own, const OEFieldRow& list) : m_fields(own, own + kWrapperOwnRows) {
        m_fields.push_back(list);
        for (const OEFieldRow& r : m_fields) m_valid.push_back(OETagRow{r.m_tag, OEVM_ALL, 0});
    }
};

const OETagRow kMultiRqRequired[] = {{OETAG_TRNUID, OEVM_ALL, 0}, {OETAG_INTERRQ, OEVM_ALL, 0}};

const OEAggregateDesc& MultiRqDesc() {
    static const MultiTables t(
        kTransRqFields,
        OEFieldRow{OETAG_INTERRQ, OEFK_LIST, OE_MEMBER(OEMultiTransRq, m_inter), nullptr, MakeInterRq});
    static const OEAggregateDesc desc{OETAG_MULTIINTERTRNRQ,
                                      t.m_valid.data(),
                                      static_cast<unsigned short>(t.m_valid.size()),
                                      kMultiRqRequired,
                                      2,
                                      t.m_fields.data(),
                                      static_cast<unsigned short>(t.m_fields.size())};
    return desc;
}

const OEAggregateDesc& MultiRsDesc() {
    static const MultiTables t(
        kTransRsFields,
        OEFieldRow{OETAG_INTERRS, OEFK_LIST, OE_MEMBER(OEMultiTransRs, m_inter), nullptr, MakeInterRs});
    static const OEAggregateDesc desc{
        OETAG_MULTIINTERTRNRS,
        t.m_valid.data(),
        static_cast<unsigned short>(t.m_valid.size()),
        kTransRsRequired,
        static_cast<unsigned short>(sizeof(kTransRsRequired) / sizeof(kTransRsRequired[0])),
        t.m_fields.data(),
        static_cast<unsigned short>(t.m_fields.size())};
    return desc;
}

const OEAggregateDesc kStatusDesc = OE_DESC(OETAG_STATUS, kStatusValid, kStatusRequired, kStatusFields);
const OEAggregateDesc kWarningDesc = OE_DESC(OETAG_WARNING, kWarningValid, kWarningValid, kWarningFields);
const OEAggregateDesc kSyncRqDesc = OE_DESC(OETAG_NONE, kSyncRqValid, kSyncRqRequired, kSyncRqFields);
// No generic required rows: the token rule below is the whole check.
const OEAggregateDesc kSyncRsDesc = OE_DESC_NO_REQUIRED(OETAG_NONE, kSyncRsValid, kSyncRsFields);

bool IsSyncWrapper(OETagID tag, bool response) {
    for (OETagID t : kSyncWrappers)
        if ((response ? OEResponseTagOf(t) : t) == tag) return true;
    return false;
}

unsigned short ExactlyOne(unsigned short a, unsigned short b) {
    return (a ? 1 : 0) + (b ? 1 : 0) == 1 ? 1 : 0;
}

} // namespace

OETagID OEResponseTagOf(OETagID requestTag) {
    OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
    if (!dictionary || requestTag == OETAG_NONE) return OETAG_NONE;
    const char* name = dictionary->GetTagString(requestTag);
    size_t n = name ? std::strlen(name) : 0;
    if (n < 2 || n > 62) return OETAG_NONE;
    // The last "RQ" of the name becomes "RS" (STMTRQ, STMTTRNRQ, BANKMSGSRQV1).
    size_t at = n - 1;
    while (at > 0 && !(name[at - 1] == 'R' && name[at] == 'Q')) --at;
    if (at == 0) return OETAG_NONE;
    char rs[64];
    std::memcpy(rs, name, n);
    rs[at] = 'S';
    OETagID id = OETAG_NONE;
    if (!dictionary->GetTagID(rs, static_cast<unsigned short>(n), &id, OECaseSensitive)) return OETAG_NONE;
    return id;
}

// ---------------------------------------------------------------- OEStatus

OEStatus::OEStatus(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_STATUS);
}
const OEAggregateDesc& OEStatus::Describe() const {
    return kStatusDesc;
}

unsigned short OEStatus::SetCode(const OEString& text) {
    const char* s = text.c_str();
    const char* p = s;
    if (*p == '-' || *p == '+') ++p;
    bool digits = *p != 0;
    for (const char* q = p; *q; ++q)
        if (*q < '0' || *q > '9') digits = false;
    if (!digits || std::strlen(p) > 12) {
        OELogParseWarning(OEPW_BADFORMAT, s, "", OETAG_CODE, this);
        return 0;
    }
    long long value = std::strtoll(s, nullptr, 10);
    if (value < -99999 || value > 999999) {
        // Out of range is reported as "too long", not "out of range": kept as the log shows it.
        OELogParseWarning(OEPW_TOOLONG, s, "", OETAG_CODE, this);
        return 0;
    }
    return SetCode(static_cast<long>(value));
}

unsigned short OEStatus::SetCode(long code) {
    return SetSigned(OETAG_CODE, code);
}

unsigned short OEStatus::SetSeverity(const OEString& text) {
    for (unsigned short i = 0; i < OEKW_SEVERITY.m_count; ++i) {
        if (text.strcmpi(OEKW_SEVERITY.m_words[i]) == 0) return SetSeverity(static_cast<OEStatusSeverity>(i));
    }
    // The conversion reports the word first (no tag), then the setter against SEVERITY.
    OELogParseWarning(OEPW_BADFORMAT, text.c_str(), "", OETAG_NONE, this);
    OELogParseWarning(OEPW_BADFORMAT, text.c_str(), "", OETAG_SEVERITY, this);
    return 0;
}

unsigned short OEStatus::SetSeverity(OEStatusSeverity severity) {
    if (!IsValidTag(OETAG_SEVERITY)) return 0;
    m_severity = static_cast<unsigned short>(severity);
    return SetTag(OETAG_SEVERITY);
}

OEParseStatus OEStatus::HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) {
    if (!entry) return OEPS_INVALID;
    switch (entry->m_id) {
    case OETAG_CODE:
        SetCode(value);
        return OEPS_OK;
    case OETAG_SEVERITY:
        SetSeverity(value);
        return OEPS_OK;
    default:
        return OEAggregate::HandleTagElement(entry, value);
    }
}

// ---------------------------------------------------------------- OEWarning

OEWarning::OEWarning(unsigned short version) : OEAggregate(version) {
    SetType(OETAG_WARNING);
}
const OEAggregateDesc& OEWarning::Describe() const {
    return kWarningDesc;
}

// ---------------------------------------------------------------- OETransWrapper

const OEFieldRow* OETransWrapper::FindInnerRow(OETagID tag) const {
    const OEFieldRow* row = FindRow(tag);
    return row && row->m_kind == OEFK_CHILD && Slot(row) == &m_actual ? row : nullptr;
}

unsigned short OETransWrapper::SetActualTrans(OETransBase* inner) {
    if (inner) return FindInnerRow(inner->GetType()) ? SetChildObj(inner->GetType(), inner) : 0;
    // Clearing goes through any one of the rows that share the inner slot.
    const OEAggregateDesc& d = Describe();
    for (unsigned short i = 0; i < d.m_fieldCount; ++i)
        if (FindInnerRow(d.m_fields[i].m_tag)) return SetChildObj(d.m_fields[i].m_tag, nullptr);
    return 0;
}

OEParseStatus OETransWrapper::NewInner(OETagID tag, OETagID efileTag) {
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    if (tag == efileTag) return m_actual.get() ? OEPS_OK : OEPS_NORESOURCE;
    const OEFieldRow* row = FindInnerRow(tag);
    if (!row) return OEPS_INVALID;
    OEDataObj* inner = row->m_make(factory, GetMsgSetVersion());
    if (!inner) {
        OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        return OEPS_NORESOURCE;
    }
    inner->SetType(tag);
    SetChildObj(tag, inner);
    return OEPS_OK;
}

OEParseStatus OETransWrapper::PushInner(OEParseStatus created, OETagID tag) {
    if (created != OEPS_OK) return created;
    return PushAndSetObject(m_actual.get(), tag);
}

// ---------------------------------------------------------------- OETransRq

OETransRq::OETransRq(unsigned short version) : OETransWrapper(version) {}
const OEAggregateDesc& OETransRq::Describe() const {
    return TransRqDesc();
}

OETagID OETransRq::MsgIDToTranWrapper(OETagID tag) {
    for (const InnerRow& r : kInner)
        if (r.m_inner == tag) return r.m_wrapper;
    return OETAG_NONE;
}

OEParseStatus OETransRq::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry) return OEPS_INVALID;
    return PushInner(NewRq(entry->m_id), entry->m_id);
}

unsigned short OETransRq::AllRequiredPresent() {
    if (!m_actual.get() || !ValidateTag(OETAG_TRNUID)) return 0;
    if (GetType() == OETAG_NONE) return 0;
    const RequiredInner* r = FindRequiredInner(GetType());
    return r ? RequiredInnerPresent(*this, *r, false) : 1;
}

// ---------------------------------------------------------------- OETransRs

OETransRs::OETransRs(unsigned short version) : OETransWrapper(version) {}
const OEAggregateDesc& OETransRs::Describe() const {
    return TransRsDesc();
}

OETransBase* OETransRs::DisconnectActualTrans() {
    OEDataObj* inner = m_actual.get();
    if (!inner) return nullptr;
    return static_cast<OETransBase*>(DisconnectChildObj(inner->GetType()));
}

unsigned short OETransRs::IsErrorStatus() const {
    const OEStatus* s = GetStatus();
    return ValidateTag(OETAG_STATUS) && s && s->ValidateTag(OETAG_SEVERITY) &&
           s->GetSeverity() == OESEV_ERROR;
}

unsigned short OETransRs::IsUpToDate() const {
    const OEStatus* s = GetStatus();
    return ValidateTag(OETAG_STATUS) && s && s->ValidateTag(OETAG_CODE) && s->GetCode() == 1;
}

OEParseStatus OETransRs::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry) return OEPS_INVALID;
    if (entry->m_id == OETAG_STATUS || entry->m_id == OETAG_WARNING) {
        if (!IsValidTag(entry->m_id)) return OEPS_INVALID;
        return StartChild(FindRow(entry->m_id), entry);
    }
    return PushInner(NewRs(entry->m_id), entry->m_id);
}

unsigned short OETransRs::AllRequiredPresent() {
    if (!m_status.get() || !ValidateTag(OETAG_TRNUID)) return 0;
    // The request wrapper's table tells which wrappers need an inner response.
    OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
    if (!dictionary || GetType() == OETAG_NONE) return 1;
    const char* name = dictionary->GetTagString(GetType());
    size_t n = name ? std::strlen(name) : 0;
    if (n < 2 || n > 62) return 1;
    char rq[64];
    std::memcpy(rq, name, n);
    rq[n - 1] = 'Q'; // the wrappers end in TRNRS
    OETagID rqTag = OETAG_NONE;
    if (!dictionary->GetTagID(rq, static_cast<unsigned short>(n), &rqTag, OECaseSensitive)) return 1;
    const RequiredInner* r = FindRequiredInner(rqTag);
    if (!r) return 1;
    if (IsErrorStatus() || IsUpToDate()) return 1;
    return RequiredInnerPresent(*this, *r, true);
}

// ---------------------------------------------------------------- OESyncBase

OESyncBase::OESyncBase(unsigned short version, bool request)
    : OEAggregate(version), m_trans(1, 5), m_request(request) {}

unsigned short OESyncBase::SetAccount(OEDataObj* account) {
    if (!account) return SetChildObj(OETAG_BANKACCTFROM, nullptr);
    return SetChildObj(account->GetType() == OETAG_CCACCTFROM ? OETAG_CCACCTFROM : OETAG_BANKACCTFROM,
                       account);
}

unsigned short OESyncBase::StoreTrans(unsigned short index, OETransWrapper* trans, bool append) {
    if (!trans) return 0;
    if (append) {
        if (!m_trans.Append(trans)) return 0;
    } else if (index > m_trans.Entries() || !m_trans.Set(index, trans)) {
        return 0;
    }
    if (trans->GetType()) SetTag(trans->GetType());
    return 1;
}

OEParseStatus OESyncBase::PushTranObject(const OETagDictionaryEntry* entry) {
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return OEPS_NORESOURCE;
    OETransWrapper* trans = m_request ? static_cast<OETransWrapper*>(factory->NewTransRq(GetMsgSetVersion()))
                                      : static_cast<OETransWrapper*>(factory->NewTransRs(GetMsgSetVersion()));
    if (trans) {
        trans->SetType(entry->m_id);
        trans->m_msgsTag = m_msgsTag;
    }
    return AdoptListChild(this, m_trans, trans, entry->m_id);
}

OEParseStatus OESyncBase::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry) return OEPS_INVALID;
    if (IsSyncWrapper(entry->m_id, !m_request)) return PushTranObject(entry);
    return OEAggregate::HandleTagStart(entry);
}

int OESyncBase::Build(OEBuilder* builder) {
    int status = OEAggregate::Build(builder);
    if (status != OEBS_OK) return status;
    return BuildEach(this, builder, m_trans);
}

OEDataObj* OESyncBase::GetChild(unsigned short index) const {
    unsigned short own = OEAggregate::GetNumberOfChildren();
    if (index < own) return OEAggregate::GetChild(index);
    return m_trans.Get(static_cast<unsigned short>(index - own));
}

unsigned short OESyncBase::GetNumberOfChildren() const {
    return static_cast<unsigned short>(OEAggregate::GetNumberOfChildren() + m_trans.Entries());
}

// Copies the wrappers (their own tags and children included) through the factory.
unsigned short OESyncBase::CopyExtraFrom(const OEAggregate* other) {
    const OESyncBase* src = static_cast<const OESyncBase*>(other);
    m_msgsTag = src->m_msgsTag;
    m_trans.DeleteAll();
    OEDataObjFactory* factory = GetFactory();
    if (!factory) return 0;
    for (unsigned short i = 0; i < src->m_trans.Entries(); ++i) {
        const OEAggregate* from = static_cast<const OEAggregate*>(src->m_trans.Get(i));
        if (!from) continue;
        unsigned short v = from->GetMsgSetVersion();
        OEAggregate* copy = m_request ? static_cast<OEAggregate*>(factory->NewTransRq(v))
                                      : static_cast<OEAggregate*>(factory->NewTransRs(v));
        if (!copy) return 0;
        if (!m_trans.Append(copy)) {
            delete copy;
            return 0;
        }
        if (!copy->DeepCopyFrom(from)) return 0;
    }
    return 1;
}

// ---------------------------------------------------------------- OEMultiTransRq / Rs

OEMultiTransRq::OEMultiTransRq(unsigned short version) : OETransRq(version), m_inter(1, 5) {
    SetType(OETAG_MULTIINTERTRNRQ);
}
const OEAggregateDesc& OEMultiTransRq::Describe() const {
    return MultiRqDesc();
}

OEParseStatus OEMultiTransRq::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (!entry || entry->m_id != OETAG_INTERRQ || !InnerRowOf(kTransRqFields, OETAG_INTERRQ))
        return OEPS_INVALID;
    return OEAggregate::HandleTagStart(entry);
}

unsigned short OEMultiTransRq::AllRequiredPresent() {
    return OEAggregate::AllRequiredPresent() && m_inter.Entries() > 0;
}

OEMultiTransRs::OEMultiTransRs(unsigned short version) : OETransRs(version), m_inter(1, 5) {
    SetType(OETAG_MULTIINTERTRNRS);
}
const OEAggregateDesc& OEMultiTransRs::Describe() const {
    return MultiRsDesc();
}

OEParseStatus OEMultiTransRs::HandleTagStart(const OETagDictionaryEntry* entry) {
    if (entry && entry->m_id == OETAG_INTERRS) {
        if (!InnerRowOf(kTransRsFields, OETAG_INTERRS)) return OEPS_INVALID;
        return OEAggregate::HandleTagStart(entry);
    }
    // STATUS and WARNING as in the plain wrapper; no other inner response has a row here.
    return OETransRs::HandleTagStart(entry);
}

// ---------------------------------------------------------------- OESyncRq

OESyncRq::OESyncRq(unsigned short version) : OESyncBase(version, true) {}
const OEAggregateDesc& OESyncRq::Describe() const {
    return kSyncRqDesc;
}

OETagID OESyncRq::MsgIDToSyncWrapper(OETagID tag) {
    switch (tag) {
    case OETAG_BANKMAILRQ:
        return OETAG_BANKMAILSYNCRQ;
    case OETAG_INTERRQ:
    case OETAG_INTERMODRQ:
    case OETAG_INTERCANRQ:
        return OETAG_INTERSYNCRQ;
    case OETAG_INTRARQ:
    case OETAG_INTRAMODRQ:
    case OETAG_INTRACANRQ:
        return OETAG_INTRASYNCRQ;
    case OETAG_INVMAILRQ:
        return OETAG_INVMAILSYNCRQ;
    case OETAG_PAYEERQ:
    case OETAG_PAYEEMODRQ:
    case OETAG_PAYEEDELRQ:
        return OETAG_PAYEESYNCRQ;
    case OETAG_PMTRQ:
    case OETAG_PMTMODRQ:
    case OETAG_PMTCANCRQ:
        return OETAG_PMTSYNCRQ;
    case OETAG_PMTMAILRQ:
        return OETAG_PMTMAILSYNCRQ;
    case OETAG_RECINTERRQ:
    case OETAG_RECINTERMODRQ:
    case OETAG_RECINTERCANRQ:
        return OETAG_RECINTERSYNCRQ;
    case OETAG_RECINTRARQ:
    case OETAG_RECINTRAMODRQ:
    case OETAG_RECINTRACANRQ:
        return OETAG_RECINTRASYNCRQ;
    case OETAG_RECPMTRQ:
    case OETAG_RECPMTMODRQ:
    case OETAG_RECPMTCANCRQ:
        return OETAG_RECPMTSYNCRQ;
    case OETAG_STPCHKRQ:
        return OETAG_STPCHKSYNCRQ;
    case OETAG_WIRERQ:
    case OETAG_WIRECANRQ:
        return OETAG_WIRESYNCRQ;
    // The payroll row leads into the update request, and takes the wrapper beside the request.
    case OETAG_K_PAYROLLRQ:
    case OETAG_K_PAYROLLTRNRQ:
        return OETAG_K_PAYROLLUPDATERQ;
    default:
        return OETAG_NONE;
    }
}

unsigned short OESyncRq::AllRequiredPresent() {
    if (!ValidateTag(OETAG_REJECTIFMISSING)) return 0;
    unsigned short token = ValidateTag(OETAG_TOKEN) ^ ValidateTag(OETAG_TOKEN2);
    if ((ValidateTag(OETAG_REFRESH) ? 1 : 0) + (ValidateTag(OETAG_TOKENONLY) ? 1 : 0) + token != 1) return 0;
    unsigned short bank = ValidateTag(OETAG_BANKACCTFROM), cc = ValidateTag(OETAG_CCACCTFROM);
    unsigned short media = ValidateTag(OETAG_INCIMAGES) && ValidateTag(OETAG_USEHTML);
    switch (GetType()) {
    case OETAG_PMTSYNCRQ:
    case OETAG_STPCHKSYNCRQ:
    case OETAG_WIRESYNCRQ:
    case OETAG_RECPMTSYNCRQ:
        return bank;
    case OETAG_INTRASYNCRQ:
    case OETAG_RECINTRASYNCRQ:
    case OETAG_RECINTERSYNCRQ:
        return ExactlyOne(bank, cc);
    case OETAG_BANKMAILSYNCRQ:
        return ExactlyOne(bank, cc) && media;
    case OETAG_INVMAILSYNCRQ:
        return ValidateTag(OETAG_INVACCTFROM) && media;
    case OETAG_MAILSYNCRQ:
    case OETAG_PMTMAILSYNCRQ:
        return media;
    default:
        return 1;
    }
}

// ---------------------------------------------------------------- OESyncRs

OESyncRs::OESyncRs(unsigned short version) : OESyncBase(version, false) {}
const OEAggregateDesc& OESyncRs::Describe() const {
    return kSyncRsDesc;
}

unsigned short OESyncRs::AllRequiredPresent() {
    if (!ValidateTag(OETAG_TOKEN) && !ValidateTag(OETAG_TOKEN2)) return 0;
    unsigned short bank = ValidateTag(OETAG_BANKACCTFROM), cc = ValidateTag(OETAG_CCACCTFROM);
    switch (GetType()) {
    case OETAG_INVMAILSYNCRS:
        return ValidateTag(OETAG_INVACCTFROM);
    case OETAG_PMTSYNCRS:
    case OETAG_RECPMTSYNCRS:
    case OETAG_STPCHKSYNCRS:
    case OETAG_WIRESYNCRS:
        return bank;
    case OETAG_INTRASYNCRS:
    case OETAG_RECINTRASYNCRS:
    case OETAG_RECINTERSYNCRS:
    case OETAG_BANKMAILSYNCRS:
    case OETAG_INTERSYNCRS:
        return ExactlyOne(bank, cc);
    case OETAG_K_PAYROLLUPDATERS:
        return ValidateTag(OETAG_TOKEN) && ValidateTag(OETAG_K_PAYCHKNEXTID) &&
               ValidateTag(OETAG_K_PAYROLLTXNEXTID) && ValidateTag(OETAG_K_EMPNEXTID) &&
               ValidateTag(OETAG_K_PITEMNEXTID);
    default:
        return 1;
    }
}
