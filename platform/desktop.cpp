#include "platform/desktop.h"

#include <QGuiApplication>

#include "platform/platform.h"

void Platform::UseDesktop() {
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
