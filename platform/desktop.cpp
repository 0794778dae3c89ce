#include "platform/desktop.h"

#include <QGuiApplication>

#include "platform/platform.h"

namespace Platform {

void UseDesktop() {
    ShowMessage = ShowMessageBox;
    AskYesNo = AskInMessageBox;
    ChooseFileToOpen = ChooseInOpenDialog;
    ChooseFileToSave = ChooseInSaveDialog;
    WarningSound = PlayWarningSound;
    Tell = TellScreenReader;
    WindowInFront = NumberInFront;
    OnWayland = [] { return QGuiApplication::platformName().startsWith("wayland"); };
    ProgramFolder = [folder = FindProgramFolder()] { return folder; };
}

}  // namespace Platform
