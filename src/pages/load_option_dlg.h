// "Load Branch and Chainage": which editors of the project a page's locations are loaded from.
#pragma once

class CGenPropertyPage;

/// Asks the user what to load and the project's editors for it, and puts it into the page's grid (location_loader.h).
/// The user is told how many lines came, when the document belongs to no project, and when no editor answers.
void AskForLocations(CGenPropertyPage& page);
