// Helpers of the builder tests: a root that writes nothing, and a builder bound to a fresh buffer
// so that its writers can be driven one by one.
#ifndef OESDK_TESTS_BUILD_BUILD_HELPERS_H
#define OESDK_TESTS_BUILD_BUILD_HELPERS_H

#include "oesdk.h"

#include <string>

namespace buildtest {

// A root that writes nothing unless told to, so the builder's writers can be driven directly.
class Probe : public OEDataObj {
public:
    int status = 0;
    bool raiseMemoryFlag = false;
    int Build(OEBuilder* builder) override {
        if (raiseMemoryFlag) OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
        if (status) builder->SetFailedObject(this);
        return status;
    }
};

inline std::string Text(OEBuffer& b) {
    return std::string(b.GetBufferPtr() ? b.GetBufferPtr() : "", b.GetBufferSize());
}

// A builder of class B (constructible from the line-end option and the end-tag flag) bound to a
// fresh buffer, ready for direct writer calls.
template <class B> struct BoundTo {
    OEBuffer buffer{0, 1024};
    Probe root;
    B builder;
    explicit BoundTo(OEBuildStringCrLfOpt crlf = OEBCL_CRLF, unsigned short endTags = 0,
                     OEBuildStringOpt strings = OEBSO_STRICT, unsigned short xmlQuote = 0)
        : builder(crlf, endTags) {
        builder.Build(&buffer, &root, strings, 0, xmlQuote);
    }
    std::string text() { return Text(buffer); }
};
using Bound = BoundTo<OEBuilder>;

} // namespace buildtest

#endif
