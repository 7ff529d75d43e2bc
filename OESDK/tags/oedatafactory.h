// OEDataObjFactory: the one place where the library creates objects on its own behalf (while
// parsing, deep-copying or making room in a container). A host that wants its own subclasses
// derives from it, overrides the New operations it cares about and installs it once with
// OEDataObj::SetFactory before the first parse.
//
// Creation rule of every aggregate operation: construct with the default constructor; on
// failure record thread error 1 and return null; otherwise give the object the version argument
// when it is non-zero, else the factory's own GetVersion(). The caller owns the result.
#ifndef OESDK_TAGS_OEDATAFACTORY_H
#define OESDK_TAGS_OEDATAFACTORY_H

#include "oeexport.h"
#include "foundation/oememory.h"

class OEString;
class OEDataObj;
class OEParseException;
class OEMIMEHeader;
class OEFile;
class OEFileRq;
class OEFileRs;
class OECurrency;
class OEInvAcctFrom;
class OEBalList;
class OEPosDebt;
class OEPosMF;
class OEPosOpt;
class OEPosOther;
class OEPosStock;
class OEInvPos;
class OEIncPos;
class OEInvBal;
class OEInvBankTran;
class OEInvBuy;
class OEInvSell;
class OEInvPosList;
class OEInvStmtRq;
class OEInvStmtRs;
class OEInvTran;
class OEInvTranList;
class OEBuyStock;
class OEBuyMF;
class OEBuyOpt;
class OEBuyDebt;
class OEBuyOther;
class OESellStock;
class OESellMF;
class OESellDebt;
class OESellOpt;
class OESellOther;
class OEIncome;
class OEJrnlFund;
class OEJrnlSec;
class OEMarginInterest;
class OEReinvest;
class OERetOfCap;
class OESplit;
class OETransfer;
class OEClosureOpt;
class OEInvExpense;
class OERequest;
class OEResponse;
class OEMessageSetRs;
class OEMessageSetRq;
class OESyncRq;
class OESyncRs;
class OETransRq;
class OELanguage;
class OEStatus;
class OETransRs;
class OESignOnRs;
class OESignOnRq;
class OEFI;
class OEPinChangeRq;
class OEPinChangeRs;
class OEMessageSetCore;
class OEMessageSetVersion;
class OEMessageSetProfile;
class OEMessageSetList;
class OEBalance;
class OEBankAccount;
class OEBankStatementRs;
class OEBankStatementRq;
class OEBankStatementTx;
class OEIncTransaction;
class OELedgerBalance;
class OEAvailableBalance;
class OEBankTransactionList;
class OECCAccount;
class OECCStatementRs;
class OECCStatementRq;
class OEFIMFAssetClass;
class OEMFAssetClass;
class OEPortion;
class OEFIPortion;
class OEDebtInfo;
class OEMFInfo;
class OEOptInfo;
class OEOtherInfo;
class OEStockInfo;
class OESecID;
class OESecInfo;
class OESecList;
class OESecRq;
class OESecListRs;
class OESecListRq;
class OEInvOOList;
class OEOO;
class OEOOBuyDebt;
class OEOOBuyMF;
class OEOOBuyOpt;
class OEOOBuyOther;
class OEOOBuyStock;
class OEOOSellDebt;
class OEOOSellMF;
class OEOOSellOpt;
class OEOOSellOther;
class OEOOSellStock;
class OEOOSwitchMF;
class OEPayee;
class OEPayee2;
class OEWarning;
class OEChallengeRs;
class OEChallengeRq;
class OESignOnInfo;
class OESignOnInfoList;
class OEProfileRq;
class OEProfileRs;
class OEClosing;
class OEStatementEndRs;
class OEStatementEndRq;
class OECCClosing;
class OECCStatementEndRs;
class OECCStatementEndRq;
class OEMultiTransRq;
class OEMultiTransRs;

class OE_API OEDataObjFactory {
public:
    explicit OEDataObjFactory(unsigned short version = 1);
    OEDataObjFactory(const OEDataObjFactory&) = delete;
    OEDataObjFactory& operator=(const OEDataObjFactory&) = delete;

    // Virtual slots, in this order.
    virtual ~OEDataObjFactory();
    virtual unsigned short GetVersion() const;

    // Creation operations, in slot order.
    virtual unsigned short* NewUShort();
    virtual OEString* NewString(unsigned short version);
    virtual OEDataObj* NewDataObj(unsigned short version);
    virtual OEParseException* NewParseException();
    virtual OEMIMEHeader* NewMIMEHeader();
    // The operations of the file, envelope and statement classes (their bodies live with the
    // classes, in messages/oefactory_messages.cpp), in slot order.
    virtual OEFile* NewFile(unsigned short version);
    virtual OEFileRq* NewFileRq(unsigned short version);
    virtual OEFileRs* NewFileRs(unsigned short version);
    virtual OECurrency* NewCurrency(unsigned short version);
    virtual OERequest* NewRequest(unsigned short version);
    virtual OEResponse* NewResponse(unsigned short version);
    virtual OEMessageSetRs* NewMessageSetRs(unsigned short version);
    virtual OEMessageSetRq* NewMessageSetRq(unsigned short version);
    virtual OESyncRq* NewSyncRq(unsigned short version);
    virtual OESyncRs* NewSyncRs(unsigned short version);
    virtual OETransRq* NewTransRq(unsigned short version);
    virtual OELanguage* NewLanguage(unsigned short version);
    virtual OEStatus* NewStatus(unsigned short version);
    virtual OETransRs* NewTransRs(unsigned short version);
    virtual OESignOnRs* NewSignOnRs(unsigned short version);
    virtual OESignOnRq* NewSignOnRq(unsigned short version);
    virtual OEChallengeRs* NewChallengeRs(unsigned short version);
    virtual OEChallengeRq* NewChallengeRq(unsigned short version);
    virtual OEFI* NewFI(unsigned short version);
    virtual OEPinChangeRq* NewPinChangeRq(unsigned short version);
    virtual OEPinChangeRs* NewPinChangeRs(unsigned short version);
    virtual OEMessageSetCore* NewMessageSetCore(unsigned short version);
    virtual OEMessageSetVersion* NewMessageSetVersion(unsigned short version);
    virtual OEMessageSetProfile* NewMessageSetProfile(unsigned short version);
    virtual OESignOnInfo* NewSignOnInfo(unsigned short version);
    virtual OEMessageSetList* NewMessageSetList(unsigned short version);
    virtual OESignOnInfoList* NewSignOnInfoList(unsigned short version);
    virtual OEProfileRq* NewProfileRq(unsigned short version);
    virtual OEProfileRs* NewProfileRs(unsigned short version);
    virtual OEBalance* NewBalance(unsigned short version);
    virtual OEBankAccount* NewBankAccount(unsigned short version);
    virtual OEInvAcctFrom* NewInvAcctFrom(unsigned short version);
    virtual OEBankStatementRs* NewBankStatementRs(unsigned short version);
    virtual OEBankStatementRq* NewBankStatementRq(unsigned short version);
    virtual OEClosing* NewClosing(unsigned short version);
    virtual OEStatementEndRs* NewStatementEndRs(unsigned short version);
    virtual OEStatementEndRq* NewStatementEndRq(unsigned short version);
    virtual OEBankStatementTx* NewBankStatementTx(unsigned short version);
    virtual OEIncTransaction* NewIncTransaction(unsigned short version);
    virtual OELedgerBalance* NewLedgerBalance(unsigned short version);
    virtual OEAvailableBalance* NewAvailableBalance(unsigned short version);
    virtual OEBankTransactionList* NewBankTransactionList(unsigned short version);
    virtual OECCAccount* NewCCAccount(unsigned short version);
    virtual OECCStatementRs* NewCCStatementRs(unsigned short version);
    virtual OECCStatementRq* NewCCStatementRq(unsigned short version);
    virtual OECCClosing* NewCCClosing(unsigned short version);
    virtual OECCStatementEndRs* NewCCStatementEndRs(unsigned short version);
    virtual OECCStatementEndRq* NewCCStatementEndRq(unsigned short version);
    virtual OEFIMFAssetClass* NewFIMFAssetClass(unsigned short version);
    virtual OEMFAssetClass* NewMFAssetClass(unsigned short version);
    virtual OEPortion* NewPortion(unsigned short version);
    virtual OEFIPortion* NewFIPortion(unsigned short version);
    virtual OEBalList* NewBalList(unsigned short version);
    virtual OEDebtInfo* NewDebtInfo(unsigned short version);
    virtual OEMFInfo* NewMFInfo(unsigned short version);
    virtual OEOptInfo* NewOptInfo(unsigned short version);
    virtual OEOtherInfo* NewOtherInfo(unsigned short version);
    virtual OEStockInfo* NewStockInfo(unsigned short version);
    virtual OEPosDebt* NewPosDebt(unsigned short version);
    virtual OEPosMF* NewPosMF(unsigned short version);
    virtual OEPosOpt* NewPosOpt(unsigned short version);
    virtual OEPosOther* NewPosOther(unsigned short version);
    virtual OEPosStock* NewPosStock(unsigned short version);
    virtual OEInvPos* NewInvPos(unsigned short version);
    virtual OEIncPos* NewIncPos(unsigned short version);
    virtual OEInvBal* NewInvBal(unsigned short version);
    virtual OEInvBankTran* NewInvBankTran(unsigned short version);
    virtual OEInvBuy* NewInvBuy(unsigned short version);
    virtual OEInvSell* NewInvSell(unsigned short version);
    virtual OEInvOOList* NewInvOOList(unsigned short version);
    virtual OEInvPosList* NewInvPosList(unsigned short version);
    virtual OEInvStmtRq* NewInvStmtRq(unsigned short version);
    virtual OEInvStmtRs* NewInvStmtRs(unsigned short version);
    virtual OEInvTran* NewInvTran(unsigned short version);
    virtual OEInvTranList* NewInvTranList(unsigned short version);
    virtual OESecID* NewSecID(unsigned short version);
    virtual OESecInfo* NewSecInfo(unsigned short version);
    virtual OESecList* NewSecList(unsigned short version);
    virtual OESecRq* NewSecRq(unsigned short version);
    virtual OESecListRs* NewSecListRs(unsigned short version);
    virtual OESecListRq* NewSecListRq(unsigned short version);
    virtual OEOO* NewOO(unsigned short version);
    virtual OEOOBuyDebt* NewOOBuyDebt(unsigned short version);
    virtual OEOOBuyMF* NewOOBuyMF(unsigned short version);
    virtual OEOOBuyOpt* NewOOBuyOpt(unsigned short version);
    virtual OEOOBuyOther* NewOOBuyOther(unsigned short version);
    virtual OEOOBuyStock* NewOOBuyStock(unsigned short version);
    virtual OEOOSellDebt* NewOOSellDebt(unsigned short version);
    virtual OEOOSellMF* NewOOSellMF(unsigned short version);
    virtual OEOOSellOpt* NewOOSellOpt(unsigned short version);
    virtual OEOOSellOther* NewOOSellOther(unsigned short version);
    virtual OEOOSellStock* NewOOSellStock(unsigned short version);
    virtual OEOOSwitchMF* NewOOSwitchMF(unsigned short version);
    virtual OEBuyStock* NewBuyStock(unsigned short version);
    virtual OEBuyMF* NewBuyMF(unsigned short version);
    virtual OEBuyOpt* NewBuyOpt(unsigned short version);
    virtual OEBuyDebt* NewBuyDebt(unsigned short version);
    virtual OEBuyOther* NewBuyOther(unsigned short version);
    virtual OESellStock* NewSellStock(unsigned short version);
    virtual OESellMF* NewSellMF(unsigned short version);
    virtual OESellDebt* NewSellDebt(unsigned short version);
    virtual OESellOpt* NewSellOpt(unsigned short version);
    virtual OESellOther* NewSellOther(unsigned short version);
    virtual OEIncome* NewIncome(unsigned short version);
    virtual OEJrnlFund* NewJrnlFund(unsigned short version);
    virtual OEJrnlSec* NewJrnlSec(unsigned short version);
    virtual OEMarginInterest* NewMarginInterest(unsigned short version);
    virtual OEReinvest* NewReinvest(unsigned short version);
    virtual OERetOfCap* NewRetOfCap(unsigned short version);
    virtual OESplit* NewSplit(unsigned short version);
    virtual OETransfer* NewTransfer(unsigned short version);
    virtual OEClosureOpt* NewClosureOpt(unsigned short version);
    virtual OEInvExpense* NewInvExpense(unsigned short version);
    virtual OEPayee* NewPayee(unsigned short version);
    virtual OEPayee2* NewPayee2(unsigned short version);
    virtual OEMultiTransRq* NewMultiTransRq(unsigned short version);
    virtual OEMultiTransRs* NewMultiTransRs(unsigned short version);
    virtual OEWarning* NewWarning(unsigned short version);
    // The next creation operations go here, each added by the change that brings its class,
    // strictly in this order so that the slot order never changes: NewFile, NewFileRq, NewFileRs,
    // NewCurrency, NewRequest, NewResponse, NewEfpRequest, NewMessageSetRs, NewMessageSetRq,
    // NewSyncRq, NewSyncRs, NewTransRq, NewLanguage, NewStatus, NewTransRs, NewSignOnRs,
    // NewSignOnRq, ..., NewBalance, ... (377 operations in all). An operation whose class does not
    // exist yet is simply absent; the ones present keep their relative order. Each one is a
    // one-liner: `return Create<OEStatus>(version);`.

protected:
    // The creation rule in one place: null (thread error 1) when memory is short, otherwise the
    // object with the argument version, or the factory's own when the argument is 0.
    template <class T> T* Create(unsigned short version) {
        T* object = OEMemory::New<T>();
        if (object) object->SetMsgSetVersion(EffectiveVersion(version));
        return object;
    }
    unsigned short EffectiveVersion(unsigned short version) const { return version ? version : GetVersion(); }

private:
    unsigned short m_version;
};

#endif
