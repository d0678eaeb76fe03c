#include "hmiphonesettingshostedsubmodule.h"

#include "hmiphonecontroller.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphonesettingsstate.h"

#include <brisken/hmiaction.h>
#include <mavrosk/projectionsource.h>
#include <taldris/intentactionrequest.h>

namespace HmiPhone {

namespace {

// The settings-menu entry's action type.
const int SettingsEntryType = 3;

} // namespace

HmiPhoneSettingsHostedSubmodule::HmiPhoneSettingsHostedSubmodule(HmiPhoneController *controller,
                                                                 QObject *parent)
    : Taldris::HmiHostedSubmodule(parent)
    , m_controller(controller)
{ }

Brisken::HmiAction *HmiPhoneSettingsHostedSubmodule::subModuleEntryAction()
{
    auto *action = new Brisken::HmiAction(hmiActionNameTr("Phone"),
                                          QStringLiteral("settings/icon_phone"), SettingsEntryType,
                                          this);
    action->setTranslationContext(QStringLiteral("HmiPhone::HmiPhoneSettingsHostedSubmodule"));
    connect(action, &Brisken::HmiAction::triggered, action,
            Taldris::IntentActionRequest(IntentAction::PhoneSettings, nullptr));
    action->enabledBinding(Mavrosk::ProjectionSource::instance(),
                           &Mavrosk::ProjectionSource::projectionDIONotActive);
    return action;
}

QString HmiPhoneSettingsHostedSubmodule::moduleIdentifier() const
{
    return QStringLiteral("PHONE");
}

QString HmiPhoneSettingsHostedSubmodule::submoduleName() const
{
    return QStringLiteral("Phone settings submodule.");
}

QString HmiPhoneSettingsHostedSubmodule::viewDescriptorFile() const
{
    return QStringLiteral("plugins/hmiphone/settings-view-descriptor.json");
}

Quorvel::HmiState *HmiPhoneSettingsHostedSubmodule::createStateHierarchy(Quorvel::HmiState *parent)
{
    if (!m_controller)
        qCWarning(hmiphone) << "HmiPhoneSettingsHostedSubmodule: the controller is gone, the "
                               "settings pages cannot stop a ringtone sample";
    return new HmiPhoneSettingsState(m_controller.data(), parent);
}

} // namespace HmiPhone
