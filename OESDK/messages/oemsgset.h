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
    unsigned short CopyFrom(const OEMessageSetBase* other);
    OETagID SignOnTag() const { return m_request ? OETAG_SONRQ : OETAG_SONRS; }

    bool m_request;
    OEDataObjList m_trans;
    OEDataObjList m_sync;
    OEDataObj* m_signOn;
    OEDataObj* m_secList; // response side only
};

class OE_API OEMessageSetRq : public OEMessageSetBase {
public:
    explicit OEMessageSetRq(unsigned short version = 0) : OEMessageSetBase(version, true) {}
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;

    unsigned short SetTrans(unsigned short index, OETransRq* trans) {
        return StoreTrans(index, trans, false);
    }
    unsigned short AppendTrans(OETransRq* trans) { return StoreTrans(0, trans, true); }
    OETransRq* GetTrans(unsigned short index) const { return static_cast<OETransRq*>(m_trans.Get(index)); }
    OETransRq* DisconnectTrans(unsigned short index) {
        return static_cast<OETransRq*>(Disconnect(m_trans, index));
    }
    // Index above the count is refused; equal to the count appends. The set's version goes to the
    // object and its children, and the object's tag is marked here.
    unsigned short SetSync(unsigned short index, OESyncRq* sync) { return StoreSync(index, sync, false); }
    unsigned short AppendSync(OESyncRq* sync) { return StoreSync(0, sync, true); }
    OESyncRq* GetSync(unsigned short index) const { return static_cast<OESyncRq*>(m_sync.Get(index)); }
    OESyncRq* DisconnectSync(unsigned short index) {
        return static_cast<OESyncRq*>(Disconnect(m_sync, index));
    }

    OESignOnRq* GetSignOnRq() const { return static_cast<OESignOnRq*>(m_signOn); }
    // Deletes the held object, clears the SONRQ mark only when `signOn` is null, stores it, and
    // then marks SONRQ in every case: so a null leaves the mark set with nothing behind it (the
    // builder skips it). Kept in this order.
    unsigned short SetSignOnRq(OESignOnRq* signOn);
    // 0 when none is held; otherwise hands it to the caller, clears the SONRQ mark, 1.
    unsigned short DisconnectSignOnRq();
    // Copies sign-on, transactions and synchronisations. A set without a sign-on in the source
    // clears the SONRS mark here, not SONRQ (kept as it is).
    unsigned short DeepCopyFrom(const OEMessageSetRq* other);

    // Inner request tag to the profile's message-set identifier (STMTRQ gives BANKMSGSET); 0 else.
    static OETagID MsgIDToMsgSetID(OETagID tag);
};

class OE_API OEMessageSetRs : public OEMessageSetBase {
public:
    explicit OEMessageSetRs(unsigned short version = 0) : OEMessageSetBase(version, false) {}
    OEParseStatus HandleTagStart(const OETagDictionaryEntry* entry) override;

    unsigned short SetTrans(unsigned short index, OETransRs* trans) {
        return StoreTrans(index, trans, false);
    }
    unsigned short AppendTrans(OETransRs* trans) { return StoreTrans(0, trans, true); }
    OETransRs* GetTrans(unsigned short index) const { return static_cast<OETransRs*>(m_trans.Get(index)); }
    OETransRs* DisconnectTrans(unsigned short index) {
        return static_cast<OETransRs*>(Disconnect(m_trans, index));
    }
    unsigned short SetSync(unsigned short index, OESyncRs* sync) { return StoreSync(index, sync, false); }
    unsigned short AppendSync(OESyncRs* sync) { return StoreSync(0, sync, true); }
    OESyncRs* GetSync(unsigned short index) const { return static_cast<OESyncRs*>(m_sync.Get(index)); }

    OESignOnRs* GetSignOnRs() const { return static_cast<OESignOnRs*>(m_signOn); }
    unsigned short SetSignOnRs(OESignOnRs* signOn);
    // The SECLIST of a security-list set, written after its wrappers.
    OESecList* GetSecList() const { return static_cast<OESecList*>(m_secList); }
    // The sign-on setter's rule: the held list is deleted, the mark cleared only for null, then
    // set in every case. A set whose tag takes no SECLIST refuses (0; the caller keeps the list).
    unsigned short SetSecList(OESecList* list);
    unsigned short DeepCopyFrom(const OEMessageSetRs* other);
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

// OFX request body.
class OE_API OERequest : public OERootBase {
public:
    explicit OERequest(unsigned short version = 0) : OERootBase(version, true) { SetType(OETAG_OFX); }
    OEMessageSetRq* GetMessageSet(unsigned short index) const {
        return static_cast<OEMessageSetRq*>(m_sets.Get(index));
    }
    unsigned short AppendMessageSet(OEMessageSetRq* set) { return Store(0, set, true); }
    unsigned short SetMessageSet(unsigned short index, OEMessageSetRq* set) {
        return Store(index, set, false);
    }
    unsigned short DeepCopyFrom(const OERequest* other) { return CopyFrom(other); }
};

// OFX response body.
class OE_API OEResponse : public OERootBase {
public:
    explicit OEResponse(unsigned short version = 0) : OERootBase(version, false) { SetType(OETAG_OFX); }
    OEMessageSetRs* GetMessageSet(unsigned short index) const {
        return static_cast<OEMessageSetRs*>(m_sets.Get(index));
    }
    unsigned short AppendMessageSet(OEMessageSetRs* set) { return Store(0, set, true); }
    unsigned short SetMessageSet(unsigned short index, OEMessageSetRs* set) {
        return Store(index, set, false);
    }
    unsigned short DeepCopyFrom(const OEResponse* other) { return CopyFrom(other); }
};

#endif
