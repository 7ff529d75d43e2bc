// The body roots (OERequest, OEResponse) and the message-set wrappers (OEMessageSetRq,
// OEMessageSetRs) that stand for every ...MSGSRQVn / ...MSGSRSVn aggregate.
#ifndef OESDK_MESSAGES_OEMSGSET_H
#define OESDK_MESSAGES_OEMSGSET_H
#include "messages/oeseclist.h"
#include "messages/oesignon.h"
#include "messages/oetrans.h"

typedef OEPtrArray<OETransRq> OETransRqList;
typedef OEPtrArray<OETransRs> OETransRsList;

// The common part of the two message-set containers: a sign-on object, a list of transaction
// wrappers and a list of synchronisation aggregates, routed by tag, and on the response side the
// security list. `Rq` selects the request side.
class OE_API OEMessageSetBase : public OEDataObj {
public:
    OEMessageSetBase(unsigned short version, bool request);
    ~OEMessageSetBase() override;
    OEMessageSetBase(const OEMessageSetBase&) = delete;
    OEMessageSetBase& operator=(const OEMessageSetBase&) = delete;

    // The version named by the wrapper's own tag: "...V1" gives 1, "...V2" gives 2, else 0.
    unsigned short GetMsgSetVersion() const override { return GetMsgSetVersionFromTag(); }
    unsigned short GetArrayOfValidTags(OEArrayOfTags& tags) const override;
    OEDataObj* GetChild(unsigned short index) const override;
    unsigned short GetNumberOfChildren() const override;
    int Build(OEBuilder* builder) override;
    unsigned short AllRequiredPresent() override;
    // The sign-on of the set's side, or a transaction wrapper, synchronisation or SECLIST its table
    // lists.
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;

    unsigned short GetNumTrans() const { return m_trans.Entries(); }
    unsigned short GetNumSync() const { return m_sync.Entries(); }
    void DeleteAllTrans() { m_trans.DeleteAll(); }
    void DeleteAllSync() { m_sync.DeleteAll(); }
    // Refuses null (0); otherwise installs the process-wide factory.
    unsigned short SetFactory(OEDataObjFactory* factory);

protected:
    // The children held one at a time (sign-on, security list): a second one logs OEPW_EXTRAAGG
    // and replaces the first.
    OEParseStatus PushSingle(const OETagDictionaryEntry* entry);
    OEParseStatus PushSyncObject(OETagID tag);
    OEParseStatus PushTranObject(OETagID tag);
    unsigned short StoreTrans(unsigned short index, OEDataObj* trans, bool append);
    unsigned short StoreSync(unsigned short index, OEDataObj* sync, bool append);
    OEDataObj* Disconnect(OEDataObjList& list, unsigned short index);
    // Copies sign-on, security list, transactions and synchronisations of a set of the same side.
    unsigned short CopyFrom(const OEMessageSetBase* other);
    OEDataObj* NewSignOn(OEDataObjFactory* factory, unsigned short version) const;
    // Deletes the held sign-on, clears its mark only when `signOn` is null, stores it, marks it.
    unsigned short StoreSignOn(OEDataObj* signOn);
    OETagID SignOnTag() const { return m_request ? OETAG_SONRQ : OETAG_SONRS; }

    bool m_request;
    OEDataObjList m_trans;
    OEDataObjList m_sync;
    OEDataObj* m_signOn;
    OEDataObj* m_secList; // response side only
};

// The typed list accessors of one side: TransT is its transaction wrapper class, SyncT its
// synchronisation class.
template <class TransT, class SyncT> class OEMessageSetLists : public OEMessageSetBase {
public:
    unsigned short SetTrans(unsigned short index, TransT* trans) { return StoreTrans(index, trans, false); }
    unsigned short AppendTrans(TransT* trans) { return StoreTrans(0, trans, true); }
    TransT* GetTrans(unsigned short index) const { return static_cast<TransT*>(m_trans.Get(index)); }
    TransT* DisconnectTrans(unsigned short index) { return static_cast<TransT*>(Disconnect(m_trans, index)); }
    // Index above the count is refused; equal to the count appends. The set's version goes to the
    // object and its children, and the object's tag is marked here.
    unsigned short SetSync(unsigned short index, SyncT* sync) { return StoreSync(index, sync, false); }
    unsigned short AppendSync(SyncT* sync) { return StoreSync(0, sync, true); }
    SyncT* GetSync(unsigned short index) const { return static_cast<SyncT*>(m_sync.Get(index)); }

protected:
    OEMessageSetLists(unsigned short version, bool request) : OEMessageSetBase(version, request) {}
};

class OE_API OEMessageSetRq : public OEMessageSetLists<OETransRq, OESyncRq> {
public:
    explicit OEMessageSetRq(unsigned short version = 0) : OEMessageSetLists(version, true) {}

    OESyncRq* DisconnectSync(unsigned short index) {
        return static_cast<OESyncRq*>(Disconnect(m_sync, index));
    }

    OESignOnRq* GetSignOnRq() const { return static_cast<OESignOnRq*>(m_signOn); }
    // Deletes the held object, clears the SONRQ mark only when `signOn` is null, stores it, and
    // then marks SONRQ in every case: so a null leaves the mark set with nothing behind it (the
    // builder skips it). Kept in this order.
    unsigned short SetSignOnRq(OESignOnRq* signOn) { return StoreSignOn(signOn); }
    // 0 when none is held; otherwise hands it to the caller, clears the SONRQ mark, 1.
    unsigned short DisconnectSignOnRq();
    // Copies sign-on, transactions and synchronisations. A set without a sign-on in the source
    // clears the SONRS mark here, not SONRQ (kept as it is).
    unsigned short DeepCopyFrom(const OEMessageSetRq* other) { return CopyFrom(other); }

    // Inner request tag to the profile's message-set identifier (STMTRQ gives BANKMSGSET); 0 else.
    static OETagID MsgIDToMsgSetID(OETagID tag);
};

class OE_API OEMessageSetRs : public OEMessageSetLists<OETransRs, OESyncRs> {
public:
    explicit OEMessageSetRs(unsigned short version = 0) : OEMessageSetLists(version, false) {}

    OESignOnRs* GetSignOnRs() const { return static_cast<OESignOnRs*>(m_signOn); }
    unsigned short SetSignOnRs(OESignOnRs* signOn) { return StoreSignOn(signOn); }
    // The SECLIST of a security-list set, written after its wrappers.
    OESecList* GetSecList() const { return static_cast<OESecList*>(m_secList); }
    // The sign-on setter's rule: the held list is deleted, the mark cleared only for null, then
    // set in every case. A set whose tag takes no SECLIST refuses (0; the caller keeps the list).
    unsigned short SetSecList(OESecList* list);
    unsigned short DeepCopyFrom(const OEMessageSetRs* other) { return CopyFrom(other); }
};

// The common part of the two roots.
class OE_API OERootBase : public OEDataObj {
public:
    OERootBase(unsigned short version, bool request);
    ~OERootBase() override;
    OERootBase(const OERootBase&) = delete;
    OERootBase& operator=(const OERootBase&) = delete;

    // The root accepts the wrappers of every version (each message set takes its version from its
    // own tag); the version stored with SetMsgSetVersion is the one it hands down.
    unsigned short GetMsgSetVersion() const override { return 0xFFFF; }
    unsigned short GetArrayOfValidTags(OEArrayOfTags& tags) const override;
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;
    int Build(OEBuilder* builder) override;
    unsigned short AllRequiredPresent() override;
    OEDataObj* GetChild(unsigned short index) const override { return m_sets.Get(index); }
    unsigned short GetNumberOfChildren() const override { return m_sets.Entries(); }

    unsigned short GetNumMessageSet() const { return m_sets.Entries(); }
    void DeleteAllMessageSet();
    unsigned short SetFactory(OEDataObjFactory* factory);

protected:
    OEParseStatus PushMsgObject(OETagID tag);
    unsigned short Store(unsigned short index, OEMessageSetBase* set, bool append);
    unsigned short CopyFrom(const OERootBase* other);

    bool m_request;
    OEPtrArray<OEMessageSetBase> m_sets;
};

// The typed accessors of one side's root: Self is the root class, SetT its message-set class.
template <class Self, class SetT> class OERootOf : public OERootBase {
public:
    SetT* GetMessageSet(unsigned short index) const { return static_cast<SetT*>(m_sets.Get(index)); }
    unsigned short AppendMessageSet(SetT* set) { return Store(0, set, true); }
    unsigned short SetMessageSet(unsigned short index, SetT* set) { return Store(index, set, false); }
    unsigned short DeepCopyFrom(const Self* other) { return CopyFrom(other); }

protected:
    OERootOf(unsigned short version, bool request) : OERootBase(version, request) { SetType(OETAG_OFX); }
};

// OFX request body.
class OE_API OERequest : public OERootOf<OERequest, OEMessageSetRq> {
public:
    explicit OERequest(unsigned short version = 0) : OERootOf(version, true) {}
};

// OFX response body.
class OE_API OEResponse : public OERootOf<OEResponse, OEMessageSetRs> {
public:
    explicit OEResponse(unsigned short version = 0) : OERootOf(version, false) {}
};

#endif
