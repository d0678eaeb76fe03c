#include "headunitwindow.h"

#include "carkeys.h"
#include "headunitscreen.h"
#include "outputwriter.h"
#include "qmlfolder.h"

#include <QDebug>
#include <QDir>
#include <QGuiApplication>
#include <QLocale>
#include <QPointer>
#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickRenderControl>
#include <QQuickView>
#include <QQuickWindow>
#include <QSGRendererInterface>
#include <QStringListModel>
#include <QTranslator>

// Resources of a static library are registered by hand, outside any namespace.
static void initWindowResources()
{
    static const bool registered = [] {
        Q_INIT_RESOURCE(window);
        return true;
    }();
    Q_UNUSED(registered)
}

namespace Simulator {

namespace {

constexpr int TraceLength = 2000; // lines kept in the window's trace
const QSize DisplaySize(1280, 720);

const char *const ExportedNames[] = {"_hmiphone", "_hmiphoneController"};

const QString TranslationFolder = QStringLiteral(":/hmiphone-sim/i18n");
const QString TranslationPrefix = QStringLiteral("hmiphone-sim_");

// The translation installed for the window's texts, if any.
QPointer<QTranslator> s_translator;

} // namespace

QStringList HeadUnitWindow::languages()
{
    initWindowResources();
    QStringList found;
    const QStringList files
            = QDir(TranslationFolder).entryList({TranslationPrefix + QLatin1Char('*')});
    for (const QString &file : files)
        found.append(file.mid(TranslationPrefix.size()).section(QLatin1Char('.'), 0, 0));
    return found;
}

bool HeadUnitWindow::installTranslation(const QString &language, QString *error)
{
    QStringList wanted{language};
    if (language.isEmpty()) {
        // The system's languages in the order the user prefers them, "de-DE" as "de".
        wanted.clear();
        const QStringList system = QLocale::system().uiLanguages();
        for (const QString &name : system)
            wanted.append(name.section(QLatin1Char('-'), 0, 0));
    }
    delete s_translator;
    const QStringList available = languages();
    for (const QString &name : qAsConst(wanted)) {
        if (name == QLatin1String("en") || name == QLatin1String("C"))
            return true;
        if (!available.contains(name))
            continue;
        auto *translator = new QTranslator(QCoreApplication::instance());
        if (!translator->load(TranslationPrefix + name, TranslationFolder)) {
            delete translator;
            break;
        }
        QCoreApplication::installTranslator(translator);
        s_translator = translator;
        return true;
    }
    if (language.isEmpty())
        return true;
    *error = QStringLiteral("no translation for %1 (en, %2)")
                     .arg(language, available.join(QStringLiteral(", ")));
    return false;
}

QCoreApplication *HeadUnitWindow::createApplication(int &argc, char **argv, Mode mode)
{
    // Off screen: Qt's minimal platform with its fonts, which needs no display (and, unlike the
    // offscreen platform, leaves nothing behind when the application ends).
    if (mode == OffScreen)
        qputenv("QT_QPA_PLATFORM", "minimal:enable_fonts");
    // Flat pages need no graphics stack; the software renderer draws the same on every machine.
    QQuickWindow::setSceneGraphBackend(QSGRendererInterface::Software);
    return new QGuiApplication(argc, argv);
}

HeadUnitWindow::HeadUnitWindow(QQmlEngine *engine, OutputWriter *output,
                               VirtualEventDispatcher *clock, ScenarioPlayer::PlayStep playStep,
                               Mode mode, const QString &qmlFolder, QObject *parent)
    : QObject(parent)
    , m_screen(new HeadUnitScreen(clock, mode == OnScreen, this))
    , m_player(new ScenarioPlayer(std::move(playStep), mode == OnScreen, this))
    , m_trace(new QStringListModel(this))
    , m_engine(engine)
    , m_mode(mode)
    , m_main(QStringLiteral("qrc:/hmiphone-sim/Main.qml"))
{
    initWindowResources();
    if (output)
        connect(output, &OutputWriter::written, this, &HeadUnitWindow::appendTrace);
    // The display reads the screen again after every step: values of the bridge change what the
    // pages show without a journal entry.
    connect(m_player, &ScenarioPlayer::played, m_screen, &HeadUnitScreen::refresh);

    QQmlContext *context = engine->rootContext();
    // Until the module exports its objects, the window's chrome sees them as null.
    for (const char *name : ExportedNames) {
        if (!context->contextProperty(QLatin1String(name)).isValid())
            context->setContextProperty(QLatin1String(name),
                                        QVariant::fromValue<QObject *>(nullptr));
    }
    context->setContextProperty(QStringLiteral("_headUnit"), m_screen);
    context->setContextProperty(QStringLiteral("_scenario"), m_player);
    context->setContextProperty(QStringLiteral("_trace"), m_trace);
    context->setContextProperty(QStringLiteral("_carKeys"), carKeysForQml());

    if (!qmlFolder.isEmpty()) {
        m_qmlFolderPath = qmlFolder;
        m_main = QUrl::fromLocalFile(QDir(qmlFolder).absoluteFilePath(QStringLiteral("Main.qml")));
    }
    if (mode == OnScreen) {
        auto *view = new QQuickView(engine, nullptr);
        view->setTitle(QStringLiteral("hmiphone-sim"));
        view->setResizeMode(QQuickView::SizeRootObjectToView);
        view->resize(DisplaySize);
        m_window = view;
    } else {
        m_renderControl = new QQuickRenderControl(this);
        m_window = new QQuickWindow(m_renderControl);
        m_window->resize(DisplaySize);
    }
    load();
    if (m_renderControl)
        m_renderControl->initialize(nullptr);
    m_screen->refresh();
}

HeadUnitWindow::~HeadUnitWindow()
{
    delete m_root;
    // The render control releases the scene graph it drew, before its window goes.
    delete m_renderControl;
    delete m_window;
}

void HeadUnitWindow::load()
{
    if (auto *view = qobject_cast<QQuickView *>(m_window)) {
        view->setSource(m_main);
        m_root = view->rootObject();
        return;
    }
    QQmlComponent component(m_engine, m_main);
    m_root = qobject_cast<QQuickItem *>(
            component.createWithInitialProperties({{QStringLiteral("displayOnly"), true}}));
    if (m_root) {
        m_root->setParentItem(m_window->contentItem());
        m_root->setSize(DisplaySize);
    } else {
        qWarning().noquote() << component.errorString();
    }
}

void HeadUnitWindow::watchQmlFolder()
{
    if (m_qmlFolderPath.isEmpty() || m_qmlFolder)
        return;
    m_qmlFolder = new QmlFolder(m_qmlFolderPath, this);
    connect(m_qmlFolder, &QmlFolder::changed, this, &HeadUnitWindow::reload);
}

void HeadUnitWindow::reload()
{
    // The engine forgets the files it compiled only once nothing made from them is left.
    if (auto *view = qobject_cast<QQuickView *>(m_window))
        view->setSource(QUrl());
    else
        delete m_root;
    m_root = nullptr;
    m_engine->clearComponentCache();
    load();
    emit reloaded();
}

void HeadUnitWindow::setScenario(const QList<ScenarioStep> &steps)
{
    m_player->setSteps(steps);
}

void HeadUnitWindow::show()
{
    m_window->show();
}

QImage HeadUnitWindow::grab()
{
    if (!m_renderControl)
        return m_window->grabWindow();
    m_renderControl->polishItems();
    m_renderControl->sync();
    return m_renderControl->grab();
}

void HeadUnitWindow::appendTrace(const QString &line)
{
    const int row = m_trace->rowCount();
    if (row >= TraceLength)
        m_trace->removeRows(0, row - TraceLength + 1);
    m_trace->insertRow(m_trace->rowCount());
    m_trace->setData(m_trace->index(m_trace->rowCount() - 1), line);
}

int HeadUnitWindow::writeScreenshots(const QString &directory, QString *error)
{
    if (!QDir().mkpath(directory)) {
        *error = QStringLiteral("cannot create %1").arg(directory);
        return -1;
    }
    QImage last = grab();
    int written = 0;
    QString failed;
    auto connection = connect(m_player, &ScenarioPlayer::played, this, [&](int line) {
        if (!failed.isEmpty())
            return;
        const QImage picture = grab();
        if (picture == last)
            return;
        last = picture;
        const QString file = QDir(directory).filePath(
                QStringLiteral("%1.png").arg(line, 3, 10, QLatin1Char('0')));
        if (!picture.save(file))
            failed = QStringLiteral("cannot write %1").arg(file);
        else
            ++written;
    });
    m_player->playAll();
    disconnect(connection);
    if (!failed.isEmpty()) {
        *error = failed;
        return -1;
    }
    return written;
}

} // namespace Simulator
