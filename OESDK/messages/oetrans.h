// Transaction wrappers (...TRNRQ / ...TRNRS), STATUS, WARNING and the synchronisation wrappers
// (...SYNCRQ / ...SYNCRS).
#ifndef OESDK_MESSAGES_OETRANS_H
#define OESDK_MESSAGES_OETRANS_H
#include "messages/oeaggregate.h"
#include "foundation/oeenums.h"

// The base of the wrappers and of every inner request and response aggregate.
class OE_API OETransBase : public OEAggregate {
public:
    explicit OETransBase(unsigned short version = 0) : OEAggregate(version) {}
};

// A severity outside the list: the initial "not set" value of a status.
const unsigned short OESEV_NOTSET = 3;

// STATUS: CODE, SEVERITY, MESSAGE (version 1), MESSAGE2 (versions 2 and up).
class OE_API OEStatus : public OEAggregate {
public:
    explicit OEStatus(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    long GetCode() const { return m_code; }
    // Text form: malformed text logs OEPW_BADFORMAT; a number outside -99999..999999 logs
    // OEPW_TOOLONG (that code, deliberately). Either way CODE stays unset and the result is 0.
    unsigned short SetCode(const OEString& text);
    unsigned short SetCode(long code);
    OEStatusSeverity GetSeverity() const { return static_cast<OEStatusSeverity>(m_severity); }
    // "INFO", "WARN", "ERROR" ignoring case. Any other word logs OEPW_BADFORMAT twice: once as the
    // conversion's own report (no tag) and once against SEVERITY.
    unsigned short SetSeverity(const OEString& text);
    unsigned short SetSeverity(OEStatusSeverity severity);
    OE_TEXT_ACCESSORS(MessageText, OETAG_MESSAGE);
    OE_TEXT_ACCESSORS(Message2Text, OETAG_MESSAGE2);
    OEParseStatus HandleTagElement(const OETagDictionaryEntry* entry, const OEString& value) override;
    using OEAggregate::HandleTagElement;

    long m_code = 0;
    unsigned short m_severity = OESEV_NOTSET;
    OEString255 m_message;
    OEString2000 m_message2;
};

// WARNING: TITLE and MSG, both required.
class OE_API OEWarning : public OEAggregate {
public:
    explicit OEWarning(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(MsgTitle, OETAG_TITLE);
    OE_TEXT_ACCESSORS(MsgBody, OETAG_MSG);

    OEString m_title, m_msg;
};

// The common part of the transaction request and response wrappers: the inner aggregate (one
// slot that every inner row of the table shares), TRNUID, CLTCOOKIE and the enclosing set's tag.
class OE_API OETransWrapper : public OETransBase {
public:
    explicit OETransWrapper(unsigned short version = 0) : OETransBase(version) {}
    OETransBase* GetActualTrans() const { return static_cast<OETransBase*>(m_actual.get()); }
    // Replaces the inner aggregate (the old one is deleted) and marks its tag; null only clears.
    // 0 for an object whose tag is no inner row of the wrapper.
    unsigned short SetActualTrans(OETransBase* inner);
    OE_TEXT_ACCESSORS(TransUserID, OETAG_TRNUID);
    OE_TEXT_ACCESSORS(ClientCookie, OETAG_CLTCOOKIE);

    unsigned short CopyExtraFrom(const OEAggregate* other) override {
        m_msgsTag = static_cast<const OETransWrapper*>(other)->m_msgsTag;
        return 1;
    }

    OEOwnedChild m_actual;
    OEString36 m_trnUid;
    OEString255 m_cltCookie;
    OETagID m_msgsTag = OETAG_NONE;

protected:
    // The field row of an inner aggregate (a child row in the inner slot), or null.
    const OEFieldRow* FindInnerRow(OETagID tag) const;
    // Creates the inner aggregate for a start tag as the actual transaction: 3 without a factory
    // or memory, 4 for a tag without a class (yet); efileTag (K.EFILERQ or K.EFILERS) succeeds
    // only when an inner aggregate is held.
    OEParseStatus NewInner(OETagID tag, OETagID efileTag);
    // After NewRq / NewRs made the inner aggregate (`created` 0), it becomes the object being parsed.
    OEParseStatus PushInner(OEParseStatus created, OETagID tag);
};

// Every transaction request wrapper; its own tag says which one.
class OE_API OETransRq : public OETransWrapper {
public:
    explicit OETransRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_TEXT_ACCESSORS(TAN, OETAG_TAN);
    OE_NUMBER_ACCESSORS(SyncCompleteInfo, unsigned short, OETAG_SYNCCOMPLETEINFO);
    OETagID GetMsgsRqTag() const { return m_msgsTag; }
    void SetMsgsRqTag(OETagID tag) { m_msgsTag = tag; }
    // Inner request tag to its wrapper tag (STMTRQ gives STMTTRNRQ); 0 for any other tag.
    static OETagID MsgIDToTranWrapper(OETagID tag);

    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;
    unsigned short AllRequiredPresent() override;

protected:
    // Creates the inner request for a start tag through the factory and keeps it as the actual
    // transaction: 0, 3 without a factory or memory, 4 for a tag with no inner class here.
    // K.EFILERQ creates nothing: 0 when an actual transaction is already held, else 3.
    OEParseStatus NewRq(OETagID tag) { return NewInner(tag, OETAG_K_EFILERQ); }

public:
    unsigned short m_syncCompleteInfo = 0;
    OEBoundedString<80> m_tan;
};

// Every transaction response wrapper.
class OE_API OETransRs : public OETransWrapper {
public:
    explicit OETransRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    // Hands the inner response to the caller (not deleted).
    OETransBase* DisconnectActualTrans();
    OEStatus* GetStatus() const { return static_cast<OEStatus*>(m_status.get()); }
    OE_SET_CHILD(Status, OEStatus, OETAG_STATUS);
    OEWarning* GetWarning() const { return static_cast<OEWarning*>(m_warning.get()); }
    OE_SET_CHILD(Warning, OEWarning, OETAG_WARNING);
    OETagID GetMsgsRsTag() const { return m_msgsTag; }
    void SetMsgsRsTag(OETagID tag) { m_msgsTag = tag; }
    // STATUS present with SEVERITY ERROR.
    unsigned short IsErrorStatus() const;
    // STATUS present with CODE 1 (the client is up to date).
    unsigned short IsUpToDate() const;

    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;
    unsigned short AllRequiredPresent() override;

protected:
    // The response side of OETransRq::NewRq, by the inner response tag.
    OEParseStatus NewRs(OETagID tag) { return NewInner(tag, OETAG_K_EFILERS); }

public:
    OEOwnedChild m_status, m_warning;
};

// MULTIINTERTRNRQ: a transaction request wrapper that carries one or more INTERRQ, in order. The
// requests live in a list of their own; the single inner slot of the plain wrapper stays empty.
class OE_API OEMultiTransRq : public OETransRq {
public:
    explicit OEMultiTransRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(InterRq, OETransBase, OETAG_INTERRQ, m_inter);
    // An INTERRQ is made by the creator the plain wrapper has for it: 4 while there is none.
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;
    // TRNUID and at least one INTERRQ.
    unsigned short AllRequiredPresent() override;

    OEDataObjList m_inter;
};

// MULTIINTERTRNRS: the response wrapper with zero or more INTERRS (none when STATUS reports an
// error).
class OE_API OEMultiTransRs : public OETransRs {
public:
    explicit OEMultiTransRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_LIST_ACCESSORS(InterRs, OETransBase, OETAG_INTERRS, m_inter);
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;

    OEDataObjList m_inter;
};

// The common part of the synchronisation request and response: TOKEN / TOKEN2, the account, the
// transaction wrappers listed after the elements, and the enclosing set's tag. `request` selects
// the side.
class OE_API OESyncBase : public OEAggregate {
public:
    OESyncBase(unsigned short version, bool request);
    OE_TEXT_ACCESSORS(Token, OETAG_TOKEN);
    OE_TEXT_ACCESSORS(Token2, OETAG_TOKEN2);
    OEDataObj* GetAccount() const { return m_account.get(); }
    // The account aggregate (BANKACCTFROM, CCACCTFROM); it is marked under its own tag.
    unsigned short SetAccount(OEDataObj* account);
    unsigned short GetNumTrans() const { return m_trans.Entries(); }
    void DeleteAllTrans() { m_trans.DeleteAll(); }

    // A transaction wrapper of the side goes to the list; any other tag as the rows say.
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;
    // The rows, then the wrappers.
    int Build(OEBuilder* builder) override;
    OEDataObj* GetChild(unsigned short index) const override;
    unsigned short GetNumberOfChildren() const override;
    // The set's tag and the wrappers.
    unsigned short CopyExtraFrom(const OEAggregate* other) override;

    OEString m_token, m_token2;
    unsigned short m_kestRefresh = 0;
    unsigned long m_syncError = 0, m_kestSyncError = 0;
    OEOwnedChild m_account;
    OEDataObjList m_trans;
    OETagID m_msgsTag = OETAG_NONE;

protected:
    // Appends a wrapper, or replaces the one at index (an index above the count is refused), and
    // marks its tag. A null wrapper is refused (0).
    unsigned short StoreTrans(unsigned short index, OETransWrapper* trans, bool append);

    bool m_request;

private:
    OEParseStatus PushTranObject(const OETagDictionaryEntry* entry);
};

// Every synchronisation request (...SYNCRQ).
class OE_API OESyncRq : public OESyncBase {
public:
    explicit OESyncRq(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_VALUE_ACCESSORS(TokenOnly, unsigned short, OETAG_TOKENONLY);
    OE_NUMBER_VALUE_ACCESSORS(Refresh, unsigned short, OETAG_REFRESH);
    OE_NUMBER_VALUE_ACCESSORS(RejectIfMissing, unsigned short, OETAG_REJECTIFMISSING);
    OE_NUMBER_VALUE_ACCESSORS(IncludeImages, unsigned short, OETAG_INCIMAGES);
    OE_NUMBER_VALUE_ACCESSORS(UseHTML, unsigned short, OETAG_USEHTML);
    OE_NUMBER_VALUE_ACCESSORS(SyncError, unsigned long, OETAG_SYNCERROR);
    OE_NUMBER_VALUE_ACCESSORS(KestRefresh, unsigned short, OETAG_KEST_REFRESH);
    OE_SET_NUMBER(KestSyncError, unsigned long, OETAG_KEST_SYNCERROR);
    unsigned short AppendTrans(OETransRq* trans) { return StoreTrans(0, trans, true); }
    unsigned short SetTrans(unsigned short index, OETransRq* trans) {
        return StoreTrans(index, trans, false);
    }
    OETransRq* GetTrans(unsigned short index) const { return static_cast<OETransRq*>(m_trans.Get(index)); }
    OETagID GetMsgsRqTag() const { return m_msgsTag; }
    void SetMsgsRqTag(OETagID tag) { m_msgsTag = tag; }
    // Inner request tag to its synchronisation wrapper; 0 for any other tag.
    static OETagID MsgIDToSyncWrapper(OETagID tag);

    unsigned short AllRequiredPresent() override;

    unsigned short m_tokenOnly = 0, m_refresh = 0, m_rejectIfMissing = 0, m_incImages = 0, m_useHtml = 0;
};

// Every synchronisation response (...SYNCRS).
class OE_API OESyncRs : public OESyncBase {
public:
    explicit OESyncRs(unsigned short version = 0);
    const OEAggregateDesc& Describe() const override;
    OE_NUMBER_VALUE_ACCESSORS(LostSync, unsigned short, OETAG_LOSTSYNC);
    OE_TEXT_ACCESSORS(TranUID, OETAG_TRNUID);
    unsigned short AppendTrans(OETransRs* trans) { return StoreTrans(0, trans, true); }
    OETransRs* GetTrans(unsigned short index) const { return static_cast<OETransRs*>(m_trans.Get(index)); }
    OETagID GetMsgsRsTag() const { return m_msgsTag; }
    void SetMsgsRsTag(OETagID tag) { m_msgsTag = tag; }

    unsigned short AllRequiredPresent() override;

    unsigned short m_lostSync = 0;
    OEString36 m_trnUid;
};

// The response tag of a request tag (STMTRQ gives STMTRS, STMTTRNRQ gives STMTTRNRS); 0 when the
// dictionary has none.
OE_API OETagID OEResponseTagOf(OETagID requestTag);

#endif
