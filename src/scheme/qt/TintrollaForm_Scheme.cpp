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

platform::FileRequest SchemeRequest(const QString& title, const QString& filter, const QString& folder,
                                    const QString& fileName) {
    platform::FileRequest request;
    request.defaultExtension = QStringLiteral("*");
    request.initialFolder = folder;
    request.fileName = fileName;
    request.filter = filter;
    request.title = title;
    request.flags = 4;
    return request;
}

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
    const platform::FileChoice choice = platformLayer().openFile(
        this, SchemeRequest(QStringLiteral("Select Colour Scheme"),
                            QStringLiteral("Colour Schemes (*.CSC)| *.CSC|All files (*.*)|*.*"),
                            Dir1 ? Dir1->path() : QString(), SchemeFileName));
    if (choice.cancelled || choice.fileName.isEmpty()) return;
    if (!ReadColorScheme(choice.fileName)) return;
    ColorSchemeFrame->update();
    engine().RefreshAll();
}

void TintrollaForm::SaveSchemeMenuItem_Click() {
    commitRename();  // the name being typed is saved with the scheme
    const platform::FileChoice choice = platformLayer().saveFile(
        this, SchemeRequest(QStringLiteral("Save Colour Scheme to"), QStringLiteral("Colour Scheme (*.CSC)| *.csc"),
                            Dir1 ? Dir1->path() : QString(), SchemeFileName));
    if (choice.cancelled || choice.fileName.isEmpty()) return;
    WriteColorScheme(choice.fileName);
}
