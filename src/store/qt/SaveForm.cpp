#include "store/qt/SaveForm.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

SaveForm::SaveForm(QWidget* parent) : QDialog(parent) {
    setObjectName(QStringLiteral("SaveForm"));
    setWindowTitle(QStringLiteral("Save Picture"));
    setModal(true);

    NameLabel = new QLabel(QStringLiteral("Name of Picture:"), this);
    SaveFilename = new QLineEdit(this);
    SaveFilename->setObjectName(QStringLiteral("SaveFilename"));
    NoteLabel = new QLabel(QStringLiteral("Note:"), this);
    NoteText = new QLabel(kNote, this);
    NoteText->setWordWrap(true);
    NoteText->setMinimumWidth(360);
    SaveButton = new QPushButton(QStringLiteral("Save in PICS Folder"), this);
    SaveButton->setObjectName(QStringLiteral("SaveButton"));
    SaveButton->setDefault(true);
    CancelButton = new QPushButton(QStringLiteral("Cancel"), this);
    CancelButton->setObjectName(QStringLiteral("CancelButton"));

    auto* grid = new QGridLayout(this);
    grid->addWidget(NameLabel, 0, 0);
    grid->addWidget(SaveFilename, 0, 1);
    grid->addWidget(NoteLabel, 1, 0, Qt::AlignTop);
    grid->addWidget(NoteText, 1, 1);
    auto* buttons = new QHBoxLayout;
    buttons->addStretch();
    buttons->addWidget(SaveButton);
    buttons->addWidget(CancelButton);
    grid->addLayout(buttons, 2, 0, 1, 2);

    connect(SaveButton, &QPushButton::clicked, this, &SaveForm::SaveButton_Click);
    connect(CancelButton, &QPushButton::clicked, this, &SaveForm::CancelButton_Click);
    Form_Load();
}

void SaveForm::Form_Load() {
    SaveFilename->setReadOnly(false);
    SaveFilename->setToolTip(QString());
}

void SaveForm::SaveButton_Click() {
    saved_ = true;
    accept();
}

void SaveForm::CancelButton_Click() {
    saved_ = false;
    SaveFilename->clear();
    reject();
}

QString SaveForm::name() const { return saved_ ? SaveFilename->text() : QString(); }
