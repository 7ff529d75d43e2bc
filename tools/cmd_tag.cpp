// oesdk tag NAME|ID: looks a tag up in the dictionary.
#include "command.h"
#include "oesdk.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {

bool ParseId(const char* text, unsigned long& id) {
    if (!*text) return false;
    for (const char* p = text; *p; ++p)
        if (*p < '0' || *p > '9') return false;
    errno = 0;
    id = std::strtoul(text, nullptr, 10);
    return errno == 0;
}

int Run(int argc, char** argv) {
    if (argc != 1) {
        std::fprintf(stderr, "oesdk tag: expected one tag name or id\n");
        return 2;
    }
    OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
    if (!dictionary) {
        std::fprintf(stderr, "oesdk tag: out of memory\n");
        return 3;
    }
    const char* arg = argv[0];
    unsigned long id = 0;
    if (ParseId(arg, id)) {
        if (id < 1 || id > NumberOfOEDictionaryEntry()) {
            std::fprintf(stderr, "oesdk tag: no tag has id %s (ids run from 1 to %u)\n", arg,
                         static_cast<unsigned>(NumberOfOEDictionaryEntry()));
            return 1;
        }
        const char* name = dictionary->GetTagString(static_cast<OETagID>(id));
        std::printf("%s\n", *name ? name : "(reserved, no name)");
        return 0;
    }
    size_t length = std::strlen(arg);
    OETagID found = OETAG_NONE;
    if (length > 0 && length < 256) {
        unsigned short n = static_cast<unsigned short>(length);
        if (!dictionary->GetTagID(arg, n, &found, OECaseSensitive))
            dictionary->GetTagID(arg, n, &found, OECaseInsensitive);
    }
    if (found == OETAG_NONE) {
        std::fprintf(stderr, "oesdk tag: unknown tag name '%s'\n", arg);
        return 1;
    }
    std::printf("%u\n", static_cast<unsigned>(found));
    return 0;
}

} // namespace

OE_TOOL_COMMAND(tag, "tag", "NAME|ID",
                "look a tag up in the dictionary: a name prints its id, an id its name", Run);
