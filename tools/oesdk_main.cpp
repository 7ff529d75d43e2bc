// oesdk: the command-line face of the library. Each command is a file of its own (cmd_*.cpp)
// that registers itself; this file only dispatches.
#include "command.h"
#include "oesdk.h"

#include <cstdio>
#include <cstring>
#include <string>

std::vector<ToolCommand>& ToolCommands() {
    static std::vector<ToolCommand> commands;
    return commands;
}

namespace {

// Attaches the calling thread for the life of the tool.
struct ThreadAttachment {
    unsigned long id;
    ThreadAttachment() : id(OEPlatform::CurrentThreadId()) { OEAttachThread(id); }
    ~ThreadAttachment() { OEDetachThread(id); }
};

void Usage(FILE* out) {
    std::fputs("usage: oesdk COMMAND [ARGS]\n\ncommands:\n", out);
    for (const ToolCommand& c : ToolCommands()) {
        std::string head = std::string(c.name) + " " + c.synopsis;
        std::fprintf(out, "  %s\n      %s\n", head.c_str(), c.summary);
    }
    std::fputs("\noptions:\n  -h, --help       show this help\n  --version        show the library version\n",
               out);
}

} // namespace

int main(int argc, char** argv) {
    ThreadAttachment attachment;
    if (argc < 2) {
        Usage(stderr);
        return 2;
    }
    std::string command = argv[1];
    if (command == "-h" || command == "--help" || command == "help") {
        Usage(stdout);
        return 0;
    }
    if (command == "--version") {
        std::printf("oesdk %s\n", OESDK_VERSION_STRING);
        return 0;
    }
    for (const ToolCommand& c : ToolCommands())
        if (command == c.name) return c.run(argc - 2, argv + 2);
    std::fprintf(stderr, "oesdk: unknown command '%s'\n\n", command.c_str());
    Usage(stderr);
    return 2;
}
