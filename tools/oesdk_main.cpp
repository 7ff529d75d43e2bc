// oesdk: the command-line face of the library.
#include "oesdk.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

const char kUsage[] =
    "usage: oesdk COMMAND [ARGS]\n"
    "\n"
    "commands:\n"
    "  tag NAME|ID      look a tag up in the dictionary: a name prints its id, an id its name\n"
    "\n"
    "options:\n"
    "  -h, --help       show this help\n"
    "  --version        show the library version\n";

// Attaches the calling thread for the life of the tool.
struct ThreadAttachment {
    unsigned long id;
    ThreadAttachment() : id(OEPlatform::CurrentThreadId()) { OEAttachThread(id); }
    ~ThreadAttachment() { OEDetachThread(id); }
};

bool ParseId(const char* text, unsigned long& id) {
    if (!*text) return false;
    for (const char* p = text; *p; ++p)
        if (*p < '0' || *p > '9') return false;
    errno = 0;
    id = std::strtoul(text, nullptr, 10);
    return errno == 0;
}

int CommandTag(int argc, char** argv) {
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
        if (!*name) {
            std::printf("(reserved, no name)\n");
            return 0;
        }
        std::printf("%s\n", name);
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

int main(int argc, char** argv) {
    ThreadAttachment attachment;
    if (argc < 2) {
        std::fputs(kUsage, stderr);
        return 2;
    }
    std::string command = argv[1];
    if (command == "-h" || command == "--help" || command == "help") {
        std::fputs(kUsage, stdout);
        return 0;
    }
    if (command == "--version") {
        std::printf("oesdk %s\n", OESDK_VERSION_STRING);
        return 0;
    }
    if (command == "tag") return CommandTag(argc - 2, argv + 2);
    std::fprintf(stderr, "oesdk: unknown command '%s'\n\n%s", command.c_str(), kUsage);
    return 2;
}
