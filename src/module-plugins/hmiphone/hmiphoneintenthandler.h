#pragma once

#include <taldris/hmiintenthandler.h>

#include <QPointer>

namespace HmiPhone {

class HmiPhoneController;

// The phone's answer to other modules and the voice system: calling a number, opening the phone,
// adding a phone, the status-bar alerts, the Siri notice, the phonebook check and two settings
// pages, by the platform's action numbers.
class HmiPhoneIntentHandler : public Taldris::HmiIntentHandler
{
    Q_OBJECT
public:
    HmiPhoneIntentHandler(HmiPhoneController *controller, QObject *parent);

    bool performAction(int action, const QVariantList &arguments, bool flag,
                       const QVariant &extra) const override;
    bool isActionEnabled(int action) const override;

private slots:
    void bluetoothDeviceConnectionChanged(bool connected);

private:
    // QML can delete the controller ("_hmiphoneController" inherits deleteLater()).
    QPointer<HmiPhoneController> m_controller;
};

} // namespace HmiPhone
