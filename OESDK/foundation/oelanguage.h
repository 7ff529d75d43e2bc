// OELanguage: the language of a sign-on, an ISO 639 three-letter code as OFX writes it (ENG,
// FRA, DEU, ...). It is a bounded string of 3 characters whose validity check asks for exactly
// three ASCII letters; the code list itself is not enforced, so codes added to the standard later
// still pass.
#ifndef OESDK_FOUNDATION_OELANGUAGE_H
#define OESDK_FOUNDATION_OELANGUAGE_H

#include "oeexport.h"
#include "foundation/oestring.h"

class OE_API OELanguage : public OEString3 {
public:
    OELanguage() {}
    OELanguage(const char* code) : OEString3(code) {}
    OELanguage(const OELanguage& other) : OEString3(other) {}
    OELanguage& operator=(const OELanguage& other) {
        OEString3::operator=(other);
        return *this;
    }
    OELanguage& operator=(const char* code) {
        OEString3::operator=(code);
        return *this;
    }
    using OEString3::operator=;

    // 1 when the code is exactly three ASCII letters (either case).
    unsigned short IsValid() const override;
};

#endif
