#pragma once

#include <QString>
#include <QtPlugin>

class QObject;

namespace Taldris {

class HmiModuleIntegration;

// The interface through which the host asks a module plug-in for its integration object.
class ModuleInterface
{
public:
    virtual ~ModuleInterface() = default;

    // Returns a new integration for the module called `name`, or null when the plug-in does not
    // provide a module of that name.
    virtual HmiModuleIntegration *createModuleIntegration(const QString &name, QObject *parent) = 0;
};

} // namespace Taldris

#define Taldris_ModuleInterface_iid "com.orvane.ivi.ModuleInterface"
Q_DECLARE_INTERFACE(Taldris::ModuleInterface, Taldris_ModuleInterface_iid)
