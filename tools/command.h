// The tool's command registry: each command lives in a file of its own and registers itself with
// one OE_TOOL_COMMAND line, so that adding a command is adding a file.
#ifndef OESDK_TOOLS_COMMAND_H
#define OESDK_TOOLS_COMMAND_H

#include <vector>

struct ToolCommand {
    const char* name;                  // first word on the command line
    const char* synopsis;              // arguments, for the usage text
    const char* summary;               // one line
    int (*run)(int argc, char** argv); // arguments after the command name; returns the exit code
};

// Every registered command, in registration order.
std::vector<ToolCommand>& ToolCommands();

struct ToolCommandRegistration {
    explicit ToolCommandRegistration(const ToolCommand& command) { ToolCommands().push_back(command); }
};

#define OE_TOOL_COMMAND(id, ...)                                                                             \
    static const ToolCommandRegistration id##_registration(ToolCommand{__VA_ARGS__})

#endif
