// Registered messages: a name is registered once and gets a number; a message is sent synchronously to a window.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

/// Anything that can be sent a message: the main frame, a view.
class KS_API CKsWindow
{
public:
    virtual ~CKsWindow() = default;
    /// Handles one message; the base answers 0, as the default window procedure.
    virtual LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam);
};

/// Number of a registered message name; the same name always gets the same number. Never 0.
KS_API unsigned KsRegisterMessage(const char* name);
/// Calls the window's procedure and returns its answer; 0 for a null window. Addresses in lParam are valid only
/// during the call.
KS_API LRESULT KsSendMessage(CKsWindow* window, unsigned message, WPARAM wParam, LPARAM lParam);
/// The shell's main window, null while there is none (a test, a command line).
KS_API CKsWindow* KsMainWindow();
KS_API void KsSetMainWindow(CKsWindow* window);

/// A message by its name. Called, it gives the number, and registers the name the first time.
struct KsNamedMessage
{
    const char* name;
    unsigned operator()() const { return KsRegisterMessage(name); }
};
namespace KsMessage {
// The names are the shell's, the misspelling in the first included.
inline constexpr KsNamedMessage SwitchBoard{"KavoShellSwitchBoardSevice"};
inline constexpr KsNamedMessage BetweenEditors{"KavoShellCommunicationBetweenEditors"};
inline constexpr KsNamedMessage ProjectManagement{"KavoShellProjectManagement"};
inline constexpr KsNamedMessage ShowToolbar{"KavoShellShowToolbar"};
inline constexpr KsNamedMessage HideToolbar{"KavoShellHideToolbar"};
inline constexpr KsNamedMessage ProjectMapChanged{"KSM_VISUAL_PROJECT_MAP_CHANGED"};
} // namespace KsMessage

/// Request codes (wParam) of the switchboard and of the messages between editors. lParam is the address of a
/// CKSComm_Package; unless a line says otherwise the answer is 0.
namespace KsRequest {
// To the switchboard: joining answers the project's handle, or 0.
inline constexpr WPARAM LeaveProject = 24;
inline constexpr WPARAM JoinProject = 25;
// To the switchboard, which hands them on as messages between editors to the other views of the sender's project. Each
// view appends to the package's objects what it has, and answers whether it had something; so does the switchboard.
inline constexpr WPARAM LoadLocations = 40;           // CKvrCBELocation: branch and chainage of each location
inline constexpr WPARAM LoadLocationsAndChannel = 49; // likewise; then the views fill in radius and channel width
inline constexpr WPARAM FetchLocation = 200;          // one CKvrCBELocation: the place picked; the first answer counts
inline constexpr WPARAM BranchNames = 201;            // CKvrCBEText: the names of the branches
inline constexpr WPARAM BedLevels = 203;              // CKvrCBEBedLevel: the ground at each cross section
inline constexpr WPARAM Branches = 204;               // CKvrCBEBranch: the branches of the network and their ends
// To the switchboard: appends a CKvrCBEView for every other view of the sender's project.
inline constexpr WPARAM ProjectViews = 202;
// Between editors. To a view of the HD parameter editor from another editor's view: 41 appends what KvrMSGGetData
// answers to the package's objects; 61 and 81 take a CKvr_CBE_ModelDataItem from them.
inline constexpr WPARAM GetData = 41;
inline constexpr WPARAM InsertData = 61;
inline constexpr WPARAM DeleteData = 81;
// To the shell, for every view of another document of the project.
inline constexpr WPARAM DataChanged = 522;
inline constexpr WPARAM LocationShown = 523; // one CKvrCBELocation: the user looks at this place
// With ProjectManagement, from the shell to every view: a project (the package's handle, its file's path as text) has
// been opened, or is about to close.
inline constexpr WPARAM ProjectOpened = 1;
inline constexpr WPARAM ProjectClosing = 3;
} // namespace KsRequest
