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
