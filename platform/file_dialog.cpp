#include "platform/desktop.h"

#include <QFileDialog>
#include <QFileInfo>

#include "platform/platform.h"
#include "platform/window_front.h"

namespace {

// Details hidden, the dialog shows the names alone, and "*" in them lets files
// without a dot through where "*.*" would not.
constexpr const char* AllFiles = "All Files (*.*) (*)";
constexpr const char* TextFiles = "Text Files (*.txt) (*.txt)";

void SetUpDialog(QFileDialog& dialog, const std::string& folder) {
    dialog.setObjectName("CommonDialog");
    dialog.setOption(QFileDialog::HideNameFilterDetails);
    dialog.setNameFilters({AllFiles, TextFiles});
    dialog.selectNameFilter(TextFiles);
    dialog.setDirectory(QString::fromStdString(folder));
    dialog.setWindowModality(Qt::ApplicationModal);
}

QString Run(QFileDialog& dialog) {
    const bool accepted = dialog.exec() == QDialog::Accepted;
    dialog.hide();
    Platform::GiveFrontBack();
    const QStringList files = dialog.selectedFiles();
    return accepted && !files.isEmpty() ? files.first() : QString();
}

std::string PathOf(const QString& file) {
    return QFile::encodeName(file).toStdString();
}

bool MayReplace(const QString& file) {
    if (!QFileInfo::exists(file)) return true;
    return Platform::AskInMessageBox(
        QFileInfo(file).fileName().toStdString() + " already exists. Do you want to replace it?",
        Platform::ProgramTitle);
}

}  // namespace

std::string Platform::ChooseInOpenDialog(const std::string& folder) {
    QFileDialog dialog(LatestInFront(), QFileDialog::tr("Open"));
    SetUpDialog(dialog, folder);
    dialog.setFileMode(QFileDialog::ExistingFile);
    return PathOf(Run(dialog));
}

// The suffix is added here, after the dialog has asked about the name as typed,
// so that the name with its suffix is asked about as well.
std::string Platform::ChooseInSaveDialog(const std::string& folder) {
    QFileDialog dialog(LatestInFront(), QFileDialog::tr("Save As"));
    SetUpDialog(dialog, folder);
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setFileMode(QFileDialog::AnyFile);
    QString file = Run(dialog);
    if (file.isEmpty() || !QFileInfo(file).suffix().isEmpty()) return PathOf(file);
    file += ".txt";
    return MayReplace(file) ? PathOf(file) : std::string();
}
