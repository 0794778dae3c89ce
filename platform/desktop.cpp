// The desktop's own functions behind the platform's names.
#include <QGuiApplication>

#include "platform/file_dialog.h"
#include "platform/message_box.h"
#include "platform/platform.h"
#include "platform/program_folder.h"
#include "platform/screen_reader.h"
#include "platform/warning_sound.h"
#include "platform/window_front.h"

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
