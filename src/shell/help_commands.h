// The commands of the Help menu.
#pragma once

#include <vector>

class CMainFrame;
class QWidget;
struct KsHelpChapter;

/// Opens the help file of the active view's editor, or, without a view, of the first one; where there is no such file,
/// the help window: with what the view has to say, and with the shell's chapters.
void ShowHelp(CMainFrame& frame);
/// The keys of the menus; name, version and licenses of the program.
std::vector<KsHelpChapter> ShellChapters();
/// "Plug-ins": which editors are there, and why one is not used.
void ShowPlugins(CMainFrame& frame);
/// Tells name and version of the program.
void ShowAbout(QWidget* parent);
