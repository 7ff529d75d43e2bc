// The factory operations of the file layer and the message classes. They live here, beside the
// classes, so that the tags layer needs only their names.
#include "tags/oedatafactory.h"

#include "file/oefile.h"
#include "foundation/oelanguage.h"
#include "messages/oebank.h"
#include "messages/oechallenge.h"
#include "messages/oecurrency.h"
#include "messages/oemsgset.h"
#include "messages/oeopenorder.h"
#include "messages/oeprofile.h"
#include "messages/oestmtend.h"
#include "messages/oeseclist.h"
#include "messages/oeinvest.h"

OEFile* OEDataObjFactory::NewFile(unsigned short version) {
    return Create<OEFile>(version);
}
OEFileRq* OEDataObjFactory::NewFileRq(unsigned short version) {
    return Create<OEFileRq>(version);
}
OEFileRs* OEDataObjFactory::NewFileRs(unsigned short version) {
    return Create<OEFileRs>(version);
}
OECurrency* OEDataObjFactory::NewCurrency(unsigned short version) {
    return Create<OECurrency>(version);
}
OERequest* OEDataObjFactory::NewRequest(unsigned short version) {
    return Create<OERequest>(version);
}
OEResponse* OEDataObjFactory::NewResponse(unsigned short version) {
    return Create<OEResponse>(version);
}
OEMessageSetRs* OEDataObjFactory::NewMessageSetRs(unsigned short version) {
    return Create<OEMessageSetRs>(version);
}
OEMessageSetRq* OEDataObjFactory::NewMessageSetRq(unsigned short version) {
    return Create<OEMessageSetRq>(version);
}
OESyncRq* OEDataObjFactory::NewSyncRq(unsigned short version) {
    return Create<OESyncRq>(version);
}
OESyncRs* OEDataObjFactory::NewSyncRs(unsigned short version) {
    return Create<OESyncRs>(version);
}
OETransRq* OEDataObjFactory::NewTransRq(unsigned short version) {
    return Create<OETransRq>(version);
}
OELanguage* OEDataObjFactory::NewLanguage(unsigned short version) {
    return Create<OELanguage>(version);
}
OEStatus* OEDataObjFactory::NewStatus(unsigned short version) {
    return Create<OEStatus>(version);
}
OETransRs* OEDataObjFactory::NewTransRs(unsigned short version) {
    return Create<OETransRs>(version);
}
OESignOnRs* OEDataObjFactory::NewSignOnRs(unsigned short version) {
    return Create<OESignOnRs>(version);
}
OESignOnRq* OEDataObjFactory::NewSignOnRq(unsigned short version) {
    return Create<OESignOnRq>(version);
}
OEFI* OEDataObjFactory::NewFI(unsigned short version) {
    return Create<OEFI>(version);
}
OEPinChangeRq* OEDataObjFactory::NewPinChangeRq(unsigned short version) {
    return Create<OEPinChangeRq>(version);
}
OEPinChangeRs* OEDataObjFactory::NewPinChangeRs(unsigned short version) {
    return Create<OEPinChangeRs>(version);
}
OEBalance* OEDataObjFactory::NewBalance(unsigned short version) {
    return Create<OEBalance>(version);
}
OEBankAccount* OEDataObjFactory::NewBankAccount(unsigned short version) {
    return Create<OEBankAccount>(version);
}
OEBankStatementRs* OEDataObjFactory::NewBankStatementRs(unsigned short version) {
    return Create<OEBankStatementRs>(version);
}
OEBankStatementRq* OEDataObjFactory::NewBankStatementRq(unsigned short version) {
    return Create<OEBankStatementRq>(version);
}
OEBankStatementTx* OEDataObjFactory::NewBankStatementTx(unsigned short version) {
    return Create<OEBankStatementTx>(version);
}
OEIncTransaction* OEDataObjFactory::NewIncTransaction(unsigned short version) {
    return Create<OEIncTransaction>(version);
}
OELedgerBalance* OEDataObjFactory::NewLedgerBalance(unsigned short version) {
    return Create<OELedgerBalance>(version);
}
OEAvailableBalance* OEDataObjFactory::NewAvailableBalance(unsigned short version) {
    return Create<OEAvailableBalance>(version);
}
OEBankTransactionList* OEDataObjFactory::NewBankTransactionList(unsigned short version) {
    return Create<OEBankTransactionList>(version);
}
OECCAccount* OEDataObjFactory::NewCCAccount(unsigned short version) {
    return Create<OECCAccount>(version);
}
OECCStatementRs* OEDataObjFactory::NewCCStatementRs(unsigned short version) {
    return Create<OECCStatementRs>(version);
}
OECCStatementRq* OEDataObjFactory::NewCCStatementRq(unsigned short version) {
    return Create<OECCStatementRq>(version);
}
OEPayee* OEDataObjFactory::NewPayee(unsigned short version) {
    return Create<OEPayee>(version);
}
OEPayee2* OEDataObjFactory::NewPayee2(unsigned short version) {
    return Create<OEPayee2>(version);
}
OEWarning* OEDataObjFactory::NewWarning(unsigned short version) {
    return Create<OEWarning>(version);
}
OEMessageSetCore* OEDataObjFactory::NewMessageSetCore(unsigned short version) {
    return Create<OEMessageSetCore>(version);
}
OEMessageSetVersion* OEDataObjFactory::NewMessageSetVersion(unsigned short version) {
    return Create<OEMessageSetVersion>(version);
}
OEMessageSetProfile* OEDataObjFactory::NewMessageSetProfile(unsigned short version) {
    return Create<OEMessageSetProfile>(version);
}
OEMessageSetList* OEDataObjFactory::NewMessageSetList(unsigned short version) {
    return Create<OEMessageSetList>(version);
}
OEChallengeRs* OEDataObjFactory::NewChallengeRs(unsigned short version) {
    return Create<OEChallengeRs>(version);
}
OEChallengeRq* OEDataObjFactory::NewChallengeRq(unsigned short version) {
    return Create<OEChallengeRq>(version);
}
OESignOnInfo* OEDataObjFactory::NewSignOnInfo(unsigned short version) {
    return Create<OESignOnInfo>(version);
}
OESignOnInfoList* OEDataObjFactory::NewSignOnInfoList(unsigned short version) {
    return Create<OESignOnInfoList>(version);
}
OEProfileRq* OEDataObjFactory::NewProfileRq(unsigned short version) {
    return Create<OEProfileRq>(version);
}
OEProfileRs* OEDataObjFactory::NewProfileRs(unsigned short version) {
    return Create<OEProfileRs>(version);
}
OEClosing* OEDataObjFactory::NewClosing(unsigned short version) {
    return Create<OEClosing>(version);
}
OEStatementEndRs* OEDataObjFactory::NewStatementEndRs(unsigned short version) {
    return Create<OEStatementEndRs>(version);
}
OEStatementEndRq* OEDataObjFactory::NewStatementEndRq(unsigned short version) {
    return Create<OEStatementEndRq>(version);
}
OECCClosing* OEDataObjFactory::NewCCClosing(unsigned short version) {
    return Create<OECCClosing>(version);
}
OECCStatementEndRs* OEDataObjFactory::NewCCStatementEndRs(unsigned short version) {
    return Create<OECCStatementEndRs>(version);
}
OECCStatementEndRq* OEDataObjFactory::NewCCStatementEndRq(unsigned short version) {
    return Create<OECCStatementEndRq>(version);
}
OEMultiTransRq* OEDataObjFactory::NewMultiTransRq(unsigned short version) {
    return Create<OEMultiTransRq>(version);
}
OEMultiTransRs* OEDataObjFactory::NewMultiTransRs(unsigned short version) {
    return Create<OEMultiTransRs>(version);
}
OEFIMFAssetClass* OEDataObjFactory::NewFIMFAssetClass(unsigned short version) {
    return Create<OEFIMFAssetClass>(version);
}
OEMFAssetClass* OEDataObjFactory::NewMFAssetClass(unsigned short version) {
    return Create<OEMFAssetClass>(version);
}
OEPortion* OEDataObjFactory::NewPortion(unsigned short version) {
    return Create<OEPortion>(version);
}
OEFIPortion* OEDataObjFactory::NewFIPortion(unsigned short version) {
    return Create<OEFIPortion>(version);
}
OEDebtInfo* OEDataObjFactory::NewDebtInfo(unsigned short version) {
    return Create<OEDebtInfo>(version);
}
OEMFInfo* OEDataObjFactory::NewMFInfo(unsigned short version) {
    return Create<OEMFInfo>(version);
}
OEOptInfo* OEDataObjFactory::NewOptInfo(unsigned short version) {
    return Create<OEOptInfo>(version);
}
OEOtherInfo* OEDataObjFactory::NewOtherInfo(unsigned short version) {
    return Create<OEOtherInfo>(version);
}
OEStockInfo* OEDataObjFactory::NewStockInfo(unsigned short version) {
    return Create<OEStockInfo>(version);
}
OEInvOOList* OEDataObjFactory::NewInvOOList(unsigned short version) {
    return Create<OEInvOOList>(version);
}
OESecID* OEDataObjFactory::NewSecID(unsigned short version) {
    return Create<OESecID>(version);
}
OESecInfo* OEDataObjFactory::NewSecInfo(unsigned short version) {
    return Create<OESecInfo>(version);
}
OESecList* OEDataObjFactory::NewSecList(unsigned short version) {
    return Create<OESecList>(version);
}
OESecRq* OEDataObjFactory::NewSecRq(unsigned short version) {
    return Create<OESecRq>(version);
}
OESecListRs* OEDataObjFactory::NewSecListRs(unsigned short version) {
    return Create<OESecListRs>(version);
}
OESecListRq* OEDataObjFactory::NewSecListRq(unsigned short version) {
    return Create<OESecListRq>(version);
}
OEOO* OEDataObjFactory::NewOO(unsigned short version) {
    return Create<OEOO>(version);
}
OEOOBuyDebt* OEDataObjFactory::NewOOBuyDebt(unsigned short version) {
    return Create<OEOOBuyDebt>(version);
}
OEOOBuyMF* OEDataObjFactory::NewOOBuyMF(unsigned short version) {
    return Create<OEOOBuyMF>(version);
}
OEOOBuyOpt* OEDataObjFactory::NewOOBuyOpt(unsigned short version) {
    return Create<OEOOBuyOpt>(version);
}
OEOOBuyOther* OEDataObjFactory::NewOOBuyOther(unsigned short version) {
    return Create<OEOOBuyOther>(version);
}
OEOOBuyStock* OEDataObjFactory::NewOOBuyStock(unsigned short version) {
    return Create<OEOOBuyStock>(version);
}
OEOOSellDebt* OEDataObjFactory::NewOOSellDebt(unsigned short version) {
    return Create<OEOOSellDebt>(version);
}
OEOOSellMF* OEDataObjFactory::NewOOSellMF(unsigned short version) {
    return Create<OEOOSellMF>(version);
}
OEOOSellOpt* OEDataObjFactory::NewOOSellOpt(unsigned short version) {
    return Create<OEOOSellOpt>(version);
}
OEOOSellOther* OEDataObjFactory::NewOOSellOther(unsigned short version) {
    return Create<OEOOSellOther>(version);
}
OEOOSellStock* OEDataObjFactory::NewOOSellStock(unsigned short version) {
    return Create<OEOOSellStock>(version);
}
OEOOSwitchMF* OEDataObjFactory::NewOOSwitchMF(unsigned short version) {
    return Create<OEOOSwitchMF>(version);
}

OEInvAcctFrom* OEDataObjFactory::NewInvAcctFrom(unsigned short version) {
    return Create<OEInvAcctFrom>(version);
}
OEBalList* OEDataObjFactory::NewBalList(unsigned short version) {
    return Create<OEBalList>(version);
}
OEPosDebt* OEDataObjFactory::NewPosDebt(unsigned short version) {
    return Create<OEPosDebt>(version);
}
OEPosMF* OEDataObjFactory::NewPosMF(unsigned short version) {
    return Create<OEPosMF>(version);
}
OEPosOpt* OEDataObjFactory::NewPosOpt(unsigned short version) {
    return Create<OEPosOpt>(version);
}
OEPosOther* OEDataObjFactory::NewPosOther(unsigned short version) {
    return Create<OEPosOther>(version);
}
OEPosStock* OEDataObjFactory::NewPosStock(unsigned short version) {
    return Create<OEPosStock>(version);
}
OEInvPos* OEDataObjFactory::NewInvPos(unsigned short version) {
    return Create<OEInvPos>(version);
}
OEIncPos* OEDataObjFactory::NewIncPos(unsigned short version) {
    return Create<OEIncPos>(version);
}
OEInvBal* OEDataObjFactory::NewInvBal(unsigned short version) {
    return Create<OEInvBal>(version);
}
OEInvBankTran* OEDataObjFactory::NewInvBankTran(unsigned short version) {
    return Create<OEInvBankTran>(version);
}
OEInvBuy* OEDataObjFactory::NewInvBuy(unsigned short version) {
    return Create<OEInvBuy>(version);
}
OEInvSell* OEDataObjFactory::NewInvSell(unsigned short version) {
    return Create<OEInvSell>(version);
}
OEInvPosList* OEDataObjFactory::NewInvPosList(unsigned short version) {
    return Create<OEInvPosList>(version);
}
OEInvStmtRq* OEDataObjFactory::NewInvStmtRq(unsigned short version) {
    return Create<OEInvStmtRq>(version);
}
OEInvStmtRs* OEDataObjFactory::NewInvStmtRs(unsigned short version) {
    return Create<OEInvStmtRs>(version);
}
OEInvTran* OEDataObjFactory::NewInvTran(unsigned short version) {
    return Create<OEInvTran>(version);
}
OEInvTranList* OEDataObjFactory::NewInvTranList(unsigned short version) {
    return Create<OEInvTranList>(version);
}
OEBuyStock* OEDataObjFactory::NewBuyStock(unsigned short version) {
    return Create<OEBuyStock>(version);
}
OEBuyMF* OEDataObjFactory::NewBuyMF(unsigned short version) {
    return Create<OEBuyMF>(version);
}
OEBuyOpt* OEDataObjFactory::NewBuyOpt(unsigned short version) {
    return Create<OEBuyOpt>(version);
}
OEBuyDebt* OEDataObjFactory::NewBuyDebt(unsigned short version) {
    return Create<OEBuyDebt>(version);
}
OEBuyOther* OEDataObjFactory::NewBuyOther(unsigned short version) {
    return Create<OEBuyOther>(version);
}
OESellStock* OEDataObjFactory::NewSellStock(unsigned short version) {
    return Create<OESellStock>(version);
}
OESellMF* OEDataObjFactory::NewSellMF(unsigned short version) {
    return Create<OESellMF>(version);
}
OESellDebt* OEDataObjFactory::NewSellDebt(unsigned short version) {
    return Create<OESellDebt>(version);
}
OESellOpt* OEDataObjFactory::NewSellOpt(unsigned short version) {
    return Create<OESellOpt>(version);
}
OESellOther* OEDataObjFactory::NewSellOther(unsigned short version) {
    return Create<OESellOther>(version);
}
OEIncome* OEDataObjFactory::NewIncome(unsigned short version) {
    return Create<OEIncome>(version);
}
OEJrnlFund* OEDataObjFactory::NewJrnlFund(unsigned short version) {
    return Create<OEJrnlFund>(version);
}
OEJrnlSec* OEDataObjFactory::NewJrnlSec(unsigned short version) {
    return Create<OEJrnlSec>(version);
}
OEMarginInterest* OEDataObjFactory::NewMarginInterest(unsigned short version) {
    return Create<OEMarginInterest>(version);
}
OEReinvest* OEDataObjFactory::NewReinvest(unsigned short version) {
    return Create<OEReinvest>(version);
}
OERetOfCap* OEDataObjFactory::NewRetOfCap(unsigned short version) {
    return Create<OERetOfCap>(version);
}
OESplit* OEDataObjFactory::NewSplit(unsigned short version) {
    return Create<OESplit>(version);
}
OETransfer* OEDataObjFactory::NewTransfer(unsigned short version) {
    return Create<OETransfer>(version);
}
OEClosureOpt* OEDataObjFactory::NewClosureOpt(unsigned short version) {
    return Create<OEClosureOpt>(version);
}
OEInvExpense* OEDataObjFactory::NewInvExpense(unsigned short version) {
    return Create<OEInvExpense>(version);
}
