#pragma once
#include <QDir>
#include <QTemporaryDir>
#include <memory>

#include "platform/ScriptedPlatform.h"
#include "shell/TintrollaForm.h"

// A main window in a temporary program folder (with an empty PICS folder),
// answered by a scripted platform. The start-up sequence runs at once unless
// asked not to; the background timer is stopped so a test drives the poll
// itself (form().BackgroundTimer_Timer()).
class FormFixture {
public:
    explicit FormFixture(bool runStartup = true);
    ~FormFixture();

    TintrollaForm& form() { return *form_; }
    Workspace& ws() { return form_->workspace(); }
    platform::ScriptedPlatform& platform() { return platform_; }
    QString programFolder() const { return dir_.path(); }
    QString picsFolder() const { return dir_.path() + QStringLiteral("/PICS"); }

    // Runs the start-up sequence now, then stops the background poll.
    void startup();

private:
    QTemporaryDir dir_;
    platform::ScriptedPlatform platform_;
    std::unique_ptr<TintrollaForm> form_;
};
