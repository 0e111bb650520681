// Colour scheme files: reading and writing the twelve boxes, and the load
// and save dialogs.
#include <QFile>
#include <QGroupBox>

#include "scheme/ColorScheme.h"
#include "scheme/SchemeFile.h"
#include "shell/TintrollaForm.h"
#include "store/qt/BrowserLists.h"

namespace {

std::string LocalPath(const QString& path) { return QFile::encodeName(path).toStdString(); }
QString FromLocalPath(const std::string& path) { return QFile::decodeName(QByteArray::fromStdString(path)); }

} // namespace

bool TintrollaForm::ReadColorScheme(const QString& path, bool showMessage, QString* problem) {
    const std::string schemePath = SchemeFile::SchemePath(LocalPath(path));
    std::vector<uint8_t> bytes;
    std::string reason;
    if (SchemeFile::Read(schemePath, bytes, reason) && LoadScheme(workspace(), bytes, reason)) {
        ToolStateChanged();
        return true;
    }
    const QString why = QString::fromStdString(reason);
    if (problem) *problem = why;
    if (showMessage)
        Ask(QStringLiteral("Error - Load Colour Scheme"),
            QStringLiteral("The colour scheme could not be loaded from\n%1\n\n%2\n\nThe colour boxes have not been changed.")
                .arg(FromLocalPath(schemePath), why),
            platform::Buttons::Ok, platform::Icon::Critical);
    return false;
}

bool TintrollaForm::WriteColorScheme(const QString& path, bool showMessage, QString* problem) {
    const std::string schemePath = SchemeFile::SchemePath(LocalPath(path));
    std::string reason;
    if (SchemeFile::Write(schemePath, workspace().Boxes, reason)) {
        SchemeFileName = FromLocalPath(schemePath);
        return true;
    }
    const QString why = QString::fromStdString(reason);
    if (problem) *problem = why;
    if (showMessage)
        Ask(QStringLiteral("Error - Save Colour Scheme"),
            QStringLiteral("The colour scheme could not be saved to\n%1\n\n%2").arg(FromLocalPath(schemePath), why),
            platform::Buttons::Ok, platform::Icon::Critical);
    return false;
}

void TintrollaForm::LoadSchemeMenuItem_Click() {
    commitRename();  // a name being typed belongs to the scheme being replaced
    platform::FileRequest request;
    request.defaultExtension = QStringLiteral("*");
    request.initialFolder = Dir1 ? Dir1->path() : QString();
    request.fileName = SchemeFileName;
    request.filter = QStringLiteral("Colour Schemes (*.CSC)| *.CSC|") + QStringLiteral("All files (*.*)|*.*");
    request.title = QStringLiteral("Select Colour Scheme");
    request.flags = 4;
    const platform::FileChoice choice = platformLayer().openFile(this, request);
    if (choice.cancelled || choice.fileName.isEmpty()) return;
    if (!ReadColorScheme(choice.fileName)) return;
    ColorSchemeFrame->update();
    engine().RefreshAll();
}

void TintrollaForm::SaveSchemeMenuItem_Click() {
    commitRename();  // the name being typed is saved with the scheme
    platform::FileRequest request;
    request.defaultExtension = QStringLiteral("*");
    request.initialFolder = Dir1 ? Dir1->path() : QString();
    request.fileName = SchemeFileName;
    request.filter = QStringLiteral("Colour Scheme (*.CSC)| *.csc");
    request.title = QStringLiteral("Save Colour Scheme to");
    request.flags = 4;
    const platform::FileChoice choice = platformLayer().saveFile(this, request);
    if (choice.cancelled || choice.fileName.isEmpty()) return;
    WriteColorScheme(choice.fileName);
}
