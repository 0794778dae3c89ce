#pragma once

namespace Help {

/// Opens the help window at the help page.
void Open();

/// Lets the help window show the help page again.
void ShowPage();

/// Hides the help window; its history stays.
void Hide();

}  // namespace Help
