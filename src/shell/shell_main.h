// The whole run of the program.
#pragma once

#include <functional>

class CMainFrame;

/// Makes the application, the main frame and what the command line asks for, and runs until the frame is closed.
/// `onStarted` is called from the event loop, when the frame is on the screen and the files are open. Returns the
/// program's exit code.
int ShellMain(int argc, char** argv, std::function<void(CMainFrame&)> onStarted = {});
