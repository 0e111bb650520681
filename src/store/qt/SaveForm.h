#pragma once
#include <QDialog>

class QLineEdit;
class QPushButton;
class QLabel;

// The small modal form that asks for the name a work is saved under.
// Save hides it with the typed name kept; Cancel empties the name.
class SaveForm : public QDialog {
    Q_OBJECT
public:
    static inline const QString kNote = QStringLiteral(
        "The current repainted picture is always saved into the PICS folder. Four separate files are written, "
        "the original picture, the repainted picture, the paint mask and the color scheme.  Only the repainted "
        "picture will appear in the OPEN file list as a (*.bmp)");

    explicit SaveForm(QWidget* parent = nullptr);

    void Form_Load();
    void SaveButton_Click();
    void CancelButton_Click();
    // The name to save under: empty after Cancel or closing the form.
    QString name() const;

    QLineEdit* SaveFilename = nullptr;
    QPushButton* SaveButton = nullptr;
    QPushButton* CancelButton = nullptr;
    QLabel* NameLabel = nullptr;
    QLabel* NoteLabel = nullptr;
    QLabel* NoteText = nullptr;

private:
    bool saved_ = false;
};
