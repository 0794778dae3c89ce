#pragma once

namespace Common {

/// Opens the help window at the help page.
void OpenHelp();

/// Lets the help window show the help page again.
void ShowHelpPage();

/// Hides the help window; its history stays.
void HideHelp();

}  // namespace Common
