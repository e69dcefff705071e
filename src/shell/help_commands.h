// The commands of the Help menu.
#pragma once

class CMainFrame;
class QWidget;

/// Whether the editor of the active view has help, or, without a view, the first editor.
bool HasHelp(const CMainFrame& frame);
/// Opens the help file of that editor; one without a file may have something to say itself.
void ShowHelp(CMainFrame& frame);
/// "Plug-ins": which editors are there, and why one is not used.
void ShowPlugins(CMainFrame& frame);
/// Tells name and version of the program.
void ShowAbout(QWidget* parent);
