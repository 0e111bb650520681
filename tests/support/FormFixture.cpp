#include "support/FormFixture.h"

#include <QTimer>

FormFixture::FormFixture(bool runStartup) {
    QDir(dir_.path()).mkpath(QStringLiteral("PICS"));
    form_ = std::make_unique<TintrollaForm>(platform_, dir_.path());
    if (runStartup) startup();
}

FormFixture::~FormFixture() {
    // Nothing modified is left to ask about when the window goes away.
    form_->workspace().PictureModified = false;
    form_->BackgroundTimer->stop();
    form_->StartupTimer->stop();
}

void FormFixture::startup() {
    form_->StartupTimer_Timer();
    form_->BackgroundTimer->stop();
}
