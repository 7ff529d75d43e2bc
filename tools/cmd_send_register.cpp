// Registers the send command with the tool (kept apart from cmd_send.cpp, which the transport
// tests link on their own).
#include "cmd_send.h"
#include "command.h"

OE_TOOL_COMMAND(send, "send", "URL REQUEST.ofx [--out REPLY.ofx] [--ca FILE] [--timeout S] [--log]",
                "post a request over HTTP(S) with certificate checks (or read a file: reply), print the net, "
                "HTTP and sign-on statuses, save the reply",
                OESDKCommandSend);
