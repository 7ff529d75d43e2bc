#include "tags/oedatafactory.h"

#include "file/oemimeheader.h"
#include "foundation/oestring.h"
#include "parse/oeparseexception.h"
#include "tags/oedataobj.h"

OEDataObjFactory::OEDataObjFactory(unsigned short version) : m_version(version) {}

OEDataObjFactory::~OEDataObjFactory() {}

unsigned short OEDataObjFactory::GetVersion() const {
    return m_version;
}

unsigned short* OEDataObjFactory::NewUShort() {
    return OEMemory::New<unsigned short>(static_cast<unsigned short>(0));
}

OEString* OEDataObjFactory::NewString(unsigned short version) {
    return Create<OEString>(version);
}

OEDataObj* OEDataObjFactory::NewDataObj(unsigned short version) {
    return Create<OEDataObj>(version);
}

OEParseException* OEDataObjFactory::NewParseException() {
    return OEMemory::New<OEParseException>();
}

OEMIMEHeader* OEDataObjFactory::NewMIMEHeader() {
    return OEMemory::New<OEMIMEHeader>();
}
