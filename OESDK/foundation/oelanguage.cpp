#include "foundation/oelanguage.h"

unsigned short OELanguage::IsValid() const {
    if (GetStrLength() != 3) return 0;
    for (const char* p = c_str(); *p; ++p) {
        const char c = *p;
        if (!((c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z'))) return 0;
    }
    return 1;
}
