#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// Bluetooth connection and the list of known devices. The whole bridge is listed in
// <mavrosk/bridge.h>.
class BluetoothSource : public DataSource
{
    Q_OBJECT
    Q_PROPERTY(bool deviceConnected READ deviceConnected WRITE setDeviceConnected NOTIFY
                       deviceConnectedChanged)
    Q_PROPERTY(int phoneDevice READ phoneDevice WRITE setPhoneDevice NOTIFY phoneDeviceChanged)
    Q_PROPERTY(int selectedDevice READ selectedDevice WRITE setSelectedDevice NOTIFY
                       selectedDeviceChanged)
    Q_PROPERTY(int deviceListCount READ deviceListCount WRITE setDeviceListCount NOTIFY
                       deviceListCountChanged)
    Q_PROPERTY(int moduleStatus READ moduleStatus WRITE setModuleStatus NOTIFY moduleStatusChanged)
    Q_PROPERTY(bool iOSAppleDeviceConnected READ iOSAppleDeviceConnected WRITE
                       setIOSAppleDeviceConnected NOTIFY iOSAppleDeviceConnectedChanged)
public:
    static BluetoothSource *instance();

    bool deviceConnected() const { return m_deviceConnected; }
    int phoneDevice() const { return m_phoneDevice; }
    int selectedDevice() const { return m_selectedDevice; }
    int deviceListCount() const { return m_deviceListCount; }
    int moduleStatus() const { return m_moduleStatus; }
    bool iOSAppleDeviceConnected() const { return m_iOSAppleDeviceConnected; }

    // Setters notify only on a real change. Those marked "module" are the module's own calls:
    // they are also journaled (not when written through setBridgeValue()).
    void setDeviceConnected(bool value);
    void setPhoneDevice(int value);
    void setSelectedDevice(int value);
    void setDeviceListCount(int value);
    void setModuleStatus(int value);
    void setIOSAppleDeviceConnected(bool value);

signals:
    void deviceConnectedChanged(bool value);
    void phoneDeviceChanged(int value);
    void selectedDeviceChanged(int value);
    void deviceListCountChanged(int value);
    void moduleStatusChanged(int value);
    void iOSAppleDeviceConnectedChanged(bool value);

private:
    BluetoothSource();
    bool m_deviceConnected = false;
    int m_phoneDevice = -1;
    int m_selectedDevice = -1;
    int m_deviceListCount = 0;
    int m_moduleStatus = 1;
    bool m_iOSAppleDeviceConnected = false;
};

} // namespace Mavrosk
