#pragma once

#include <taldris/hmihostedsubmodule.h>

#include <QPointer>

namespace HmiPhone {

class HmiPhoneController;

// The phone's pages inside the head unit's settings module: the "Phone" entry of the settings
// menu, and on request the settings state subtree under a state of the settings module.
class HmiPhoneSettingsHostedSubmodule : public Taldris::HmiHostedSubmodule
{
    Q_OBJECT
public:
    HmiPhoneSettingsHostedSubmodule(HmiPhoneController *controller, QObject *parent);

    // A new "Phone" entry on every call, parented to the submodule: choosing it asks for the
    // phone settings (intent action 7); it is enabled while no projection holds the display.
    Brisken::HmiAction *subModuleEntryAction() override;
    QString moduleIdentifier() const override;
    QString submoduleName() const override;
    QString viewDescriptorFile() const override;
    Quorvel::HmiState *createStateHierarchy(Quorvel::HmiState *parent) override;

private:
    QPointer<HmiPhoneController> m_controller; // QML can delete it (deleteLater())
};

} // namespace HmiPhone
