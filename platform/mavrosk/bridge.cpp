#include "bridge.h"

#include <QMetaMethod>

namespace Mavrosk {

QList<DataSource *> createAll()
{
    PhoneSource::instance();
    EAPhoneSource::instance();
    BluetoothSource::instance();
    ProjectionSource::instance();
    SpeechSource::instance();
    KeySource::instance();
    NavSource::instance();
    GlobalSource::instance();
    ArdelSource::instance();
    return DataSource::sources();
}

void resetAll()
{
    // Sources not built yet still hold their initial values; build them all so that the
    // reset is complete and the order of first use does not matter.
    const QList<DataSource *> sources = createAll();
    for (DataSource *source : sources)
        source->reset();
}

namespace {

QList<QPair<QString, MultiDPListModel *>> findListModels()
{
    QList<QPair<QString, MultiDPListModel *>> models;
    for (DataSource *source : createAll()) {
        const QMetaObject *meta = source->metaObject();
        for (int i = meta->methodOffset(); i < meta->methodCount(); ++i) {
            const QMetaMethod method = meta->method(i);
            const QMetaType type(method.returnType());
            if (method.methodType() != QMetaMethod::Method || method.parameterCount() != 0
                || !type.metaObject()
                || !type.metaObject()->inherits(&MultiDPListModel::staticMetaObject))
                continue;
            MultiDPListModel *model = nullptr;
            // A getter returns its model as its own type, a class derived from the list model
            // alone: the pointer it writes is the list model's.
            void *result = nullptr;
            QGenericReturnArgument returned(method.typeName(), &result);
            if (method.invoke(source, Qt::DirectConnection, returned))
                model = static_cast<MultiDPListModel *>(result);
            if (model)
                models.append({source->shortName() + QLatin1Char('.')
                                       + QString::fromLatin1(method.name()),
                               model});
        }
    }
    return models;
}

} // namespace

QList<QPair<QString, MultiDPListModel *>> listModels()
{
    // The sources and their models live as long as the process: looked up once.
    static const QList<QPair<QString, MultiDPListModel *>> models = findListModels();
    return models;
}

MultiDPListModel *listModel(const QString &name)
{
    for (const auto &model : listModels()) {
        if (model.first == name)
            return model.second;
    }
    return nullptr;
}

} // namespace Mavrosk
