// The whole run of the program.
#pragma once

/// Does what the command line asks for and returns the program's exit code (commands.h), whatever happens: without
/// memory, too, there is a message.
int Hdkv(int argc, char** argv);
