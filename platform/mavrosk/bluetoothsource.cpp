#include "bluetoothsource.h"

namespace Mavrosk {

BluetoothSource::BluetoothSource()
    : DataSource(QStringLiteral("bluetooth"))
{ }

BluetoothSource *BluetoothSource::instance()
{
    static BluetoothSource *const source = adopt(new BluetoothSource);
    return source;
}

void BluetoothSource::setDeviceConnected(bool value)
{
    update(m_deviceConnected, value, &BluetoothSource::deviceConnectedChanged);
}

void BluetoothSource::setPhoneDevice(int value)
{
    update(m_phoneDevice, value, &BluetoothSource::phoneDeviceChanged);
}

void BluetoothSource::setSelectedDevice(int value)
{
    update(m_selectedDevice, value, &BluetoothSource::selectedDeviceChanged);
}

void BluetoothSource::setDeviceListCount(int value)
{
    update(m_deviceListCount, value, &BluetoothSource::deviceListCountChanged);
}

void BluetoothSource::setModuleStatus(int value)
{
    update(m_moduleStatus, value, &BluetoothSource::moduleStatusChanged);
}

void BluetoothSource::setIOSAppleDeviceConnected(bool value)
{
    update(m_iOSAppleDeviceConnected, value, &BluetoothSource::iOSAppleDeviceConnectedChanged);
}

} // namespace Mavrosk
