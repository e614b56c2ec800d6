#include "window/declarativecoveraction.h"
#include "window/declarativecoveractionlist.h"
#include "window/windowpropertypublisher.h"

#include <QDBusConnection>
#include <QDBusConnectionInterface>
#include <QDBusMessage>
#include <QProcess>
#include <QQuickWindow>
#include <QTemporaryDir>
#include <QtTest>

#include <grp.h>
#include <linux/sched.h>
#include <signal.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

// A private bus that, unlike an ordinary session bus, admits every user: the caller check
// is tested against a second process running under another uid.
static const char BusConfig[] =
        "<busconfig><type>session</type><listen>unix:path=%1</listen><auth>EXTERNAL</auth>"
        "<policy context=\"default\"><allow user=\"*\"/><allow send_destination=\"*\" eavesdrop=\"true\"/>"
        "<allow eavesdrop=\"true\"/><allow own=\"*\"/></policy>"
        "<limit name=\"max_names_per_connection\">40</limit></busconfig>\n";

// A root process that takes the given pid, as a later process would when pids wrap round.
static pid_t startRootProcessWithPid(pid_t pid)
{
    struct clone_args args;
    memset(&args, 0, sizeof args);
    args.exit_signal = SIGCHLD;
    pid_t wanted = pid;
    args.set_tid = quint64(quintptr(&wanted));
    args.set_tid_size = 1;
    const long made = ::syscall(SYS_clone3, &args, sizeof args);
    if (made == 0) {
        ::execl("/bin/sleep", "sleep", "30", static_cast<char *>(nullptr));
        ::_exit(127);
    }
    return pid_t(made);
}

namespace {
QStringList s_messages;
void collectMessages(QtMsgType, const QMessageLogContext &, const QString &text) { s_messages << text; }
} // namespace

class tst_DeclarativeCoverActionList : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_busDir.isValid());
        QFile::setPermissions(m_busDir.path(), QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner
                                                      | QFileDevice::ReadOther | QFileDevice::ExeOther
                                                      | QFileDevice::ReadGroup | QFileDevice::ExeGroup);
        const QString socket = m_busDir.filePath(QStringLiteral("bus"));
        QFile config(m_busDir.filePath(QStringLiteral("bus.conf")));
        QVERIFY(config.open(QIODevice::WriteOnly));
        config.write(QString::fromLatin1(BusConfig).arg(socket).toUtf8());
        config.close();

        m_bus.start(QStringLiteral("dbus-daemon"), { QStringLiteral("--config-file=") + config.fileName(),
                                                     QStringLiteral("--nofork"), QStringLiteral("--print-address") });
        QVERIFY(m_bus.waitForStarted());
        QTRY_VERIFY(m_bus.canReadLine());
        m_address = QString::fromUtf8(m_bus.readLine()).trimmed();
        // Before the first use of the session bus in this process.
        qputenv("DBUS_SESSION_BUS_ADDRESS", m_address.toUtf8());
        QVERIFY(QDBusConnection::sessionBus().isConnected());
    }

    void cleanupTestCase()
    {
        m_bus.terminate();
        m_bus.waitForFinished();
    }

    void cleanup()
    {
        WindowPropertyPublisher::setSinkForTesting({});
        qDeleteAll(m_made);
        m_made.clear();
        m_window.reset();
    }

    // Each list owns a numbered name on the bus while it lives; a call after it went finds
    // no one.
    void listsOwnNumberedNamesWhileTheyLive()
    {
        DeclarativeCoverActionList *first = makeList(1);
        DeclarativeCoverActionList *second = makeList(1);
        const QString pid = QString::number(QCoreApplication::applicationPid());
        const QString name = second->serviceName();
        QCOMPARE(first->serviceName(), QStringLiteral("org.quorvaneos.coveraction.pid%1.id1").arg(pid));
        QCOMPARE(name, QStringLiteral("org.quorvaneos.coveraction.pid%1.id2").arg(pid));
        QCOMPARE(second->objectPath(), QStringLiteral("/org/quorvaneos/coveraction/pid%1/id2").arg(pid));
        QVERIFY(first->isRegistered() && second->isRegistered());
        QDBusConnectionInterface *bus = QDBusConnection::sessionBus().interface();
        QVERIFY(bus->isServiceRegistered(first->serviceName()));
        QVERIFY(bus->registeredServiceNames().value().contains(name));

        m_made.removeOne(second);
        delete second;
        QVERIFY(!bus->registeredServiceNames().value().contains(name));
        QVERIFY(bus->isServiceRegistered(first->serviceName()));
        QDBusMessage call = QDBusMessage::createMethodCall(name, QLatin1Char('/') + QString(name).replace(QLatin1Char('.'), QLatin1Char('/')),
                                                          QStringLiteral("org.quorvaneos.pelkan.coveraction"), QStringLiteral("trigger"));
        call << 0;
        QCOMPARE(QDBusConnection::sessionBus().call(call).errorName(), QStringLiteral("org.freedesktop.DBus.Error.ServiceUnknown"));
    }

    void callers_data()
    {
        QTest::addColumn<QString>("mode");
        QTest::addColumn<QString>("group"); // empty: the caller runs as root
        QTest::addColumn<int>("index");
        QTest::addColumn<int>("triggered"); // which of three actions fires, -1 for none
        QTest::newRow("root, first") << "plain" << "" << 0 << 0;
        QTest::newRow("root, third") << "plain" << "" << 2 << 2;
        QTest::newRow("root, past the end") << "plain" << "" << 3 << -1;
        QTest::newRow("root, negative") << "plain" << "" << -1 << -1;
        QTest::newRow("another user") << "plain" << "nogroup" << 0 << -1;
        QTest::newRow("another user in the privileged group") << "plain" << "privileged" << 0 << 0;
        QTest::newRow("connection handed to a child, parent runs a set-uid program") << "setuid" << "nogroup" << 0 << -1;
        QTest::newRow("connection kept by a child, a root process reuses the pid") << "pidreuse" << "nogroup" << 0 << -1;
    }

    // Only root or a caller in the privileged group may press, also when the process behind
    // a connection made as another user is made to look privileged afterwards.
    void callers()
    {
        QFETCH(QString, mode);
        QFETCH(QString, group);
        QFETCH(int, index);
        QFETCH(int, triggered);
        if (::getuid() != 0)
            QSKIP("running callers as root and under another uid needs root");
        if (group == QLatin1String("privileged") && QProcess::execute(QStringLiteral("groupadd"), { QStringLiteral("-f"), group }) != 0)
            QSKIP("cannot create the group privileged here");
        const struct group *entry = group.isEmpty() ? nullptr : ::getgrnam(group.toUtf8().constData());
        QVERIFY(group.isEmpty() || entry);
        // The programs are copied where user 65534 may run them; the set-uid one blocks.
        const QString caller = m_busDir.filePath(QStringLiteral("forgedcaller"));
        const QString blocker = m_busDir.filePath(QStringLiteral("setuid-sleep"));
        if (!QFile::exists(caller)) {
            QVERIFY(QFile::copy(QStringLiteral(FORGED_CALLER), caller));
            QVERIFY(QFile::copy(QStringLiteral("/bin/sleep"), blocker));
            QVERIFY(::chmod(QFile::encodeName(blocker).constData(), 04755) == 0);
        }
        // The caller writes its answer where user 65534 may write.
        const QString results = m_busDir.filePath(QStringLiteral("results"));
        QVERIFY(QDir().mkpath(results));
        QVERIFY(::chmod(QFile::encodeName(results).constData(), 0777) == 0);
        const QString result = results + QLatin1Char('/') + QString::fromLatin1(QTest::currentDataTag()).replace(QLatin1Char(' '), QLatin1Char('-'));

        DeclarativeCoverActionList *list = makeList(3);
        QList<QSharedPointer<QSignalSpy>> spies;
        for (DeclarativeCoverAction *action : list->actionList())
            spies << QSharedPointer<QSignalSpy>::create(action, &DeclarativeCoverAction::triggered);
        QStringList arguments { caller, mode, m_address, list->serviceName(), list->objectPath(), result };
        if (entry)
            arguments = QStringList { QStringLiteral("--reuid=65534"), QStringLiteral("--regid=%1").arg(entry->gr_gid), QStringLiteral("--clear-groups") } + arguments;
        else
            arguments.prepend(QStringLiteral("--"));
        arguments << (mode == QLatin1String("setuid") ? blocker : QString::number(index));
        if (mode == QLatin1String("pidreuse"))
            arguments.removeLast();
        if (index < 0 || index >= 3)
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^CoverActionList: no action at index")));
        QProcess opener;
        opener.start(QStringLiteral("setpriv"), arguments);
        QVERIFY(opener.waitForStarted());

        pid_t reused = 0;
        if (mode == QLatin1String("pidreuse")) {
            QVERIFY(opener.waitForFinished(10000));
            QFile pidFile(result + QStringLiteral(".pid"));
            QVERIFY(pidFile.open(QIODevice::ReadOnly));
            reused = startRootProcessWithPid(pid_t(pidFile.readAll().toInt()));
            if (reused < 0)
                QSKIP("this kernel does not let root choose a pid (clone3 with set_tid)");
        }
        QFile answer(result);
        QTRY_VERIFY2_WITH_TIMEOUT(answer.exists(), opener.readAllStandardError().constData(), 15000);
        opener.kill();
        opener.waitForFinished();
        if (reused > 0) {
            ::kill(reused, SIGKILL);
            ::waitpid(reused, nullptr, 0);
        }
        QVERIFY(answer.open(QIODevice::ReadOnly));
        const QString text = QString::fromUtf8(answer.readAll());
        for (int i = 0; i < spies.size(); ++i)
            QCOMPARE(spies.at(i)->count(), i == triggered ? 1 : 0);
        if (group.isEmpty() || group == QLatin1String("privileged"))
            QCOMPARE(text, QStringLiteral("ok"));
        else {
            QVERIFY2(text.startsWith(QLatin1String("org.freedesktop.DBus.Error.AccessDenied\n")), qPrintable(text));
            QVERIFY2(text.contains(QRegularExpression(QStringLiteral("PID \\d+ is not in privileged group"))), qPrintable(text));
        }
    }

    void payload_data()
    {
        QTest::addColumn<quint64>("windowId");
        QTest::addColumn<bool>("enabled");
        QTest::addColumn<int>("actions");
        QTest::addColumn<bool>("iconBackground");
        QTest::addColumn<QString>("expected");
        const QString n = QStringLiteral("org.quorvaneos.coveraction.pid7.id1");
        QTest::newRow("no actions") << quint64(5) << true << 0 << false << "";
        QTest::newRow("one action") << quint64(5) << true << 1 << false << n + "\ntrigger\n0\nimage://theme/icon-0\n0";
        QTest::newRow("two actions") << quint64(5) << true << 2 << true
                                     << n + "\ntrigger\n0\nimage://theme/icon-0\n" + n + "\ntrigger\n1\nimage://theme/icon-1\n1";
        QTest::newRow("disabled") << quint64(5) << false << 2 << true << "";
        QTest::newRow("no window id") << quint64(0) << true << 2 << true << "";
    }

    void payload()
    {
        QFETCH(quint64, windowId);
        QFETCH(bool, enabled);
        QFETCH(int, actions);
        QFETCH(bool, iconBackground);
        QFETCH(QString, expected);
        QList<QUrl> icons;
        for (int i = 0; i < actions; ++i)
            icons << QUrl(QStringLiteral("image://theme/icon-%1").arg(i));
        const QString payload = DeclarativeCoverActionList::buildPayload(
                windowId, enabled, QStringLiteral("org.quorvaneos.coveraction.pid7.id1"), icons, iconBackground);
        QCOMPARE(payload, expected);
        if (!expected.isEmpty())
            QCOMPARE(payload.split(QLatin1Char('\n')).size(), 4 * actions + 1);
    }

    void removeEntries_data()
    {
        QTest::addColumn<QString>("payload");
        QTest::addColumn<QString>("expected");
        const QString a = QStringLiteral("org.quorvaneos.coveraction.pid7.id1");
        const QString b = QStringLiteral("org.quorvaneos.coveraction.pid7.id2");
        QTest::newRow("other list stays") << a + "\ntrigger\n0\nx\n" + b + "\ntrigger\n0\ny\n1" << b + "\ntrigger\n0\ny\n1";
        QTest::newRow("other list first") << b + "\ntrigger\n0\ny\n" + a + "\ntrigger\n0\nx\n1" << b + "\ntrigger\n0\ny\n1";
        QTest::newRow("only this list") << a + "\ntrigger\n0\nx\n" + a + "\ntrigger\n1\nz\n0" << "";
        QTest::newRow("cut short") << a + "\ntrigger" << "";
        QTest::newRow("not ours, unreadable") << "garbage\n" + b + "\ntrigger\n0\ny\n1" << b + "\ntrigger\n0\ny\n1";
    }

    void removeEntries()
    {
        QFETCH(QString, payload);
        QFETCH(QString, expected);
        QCOMPARE(DeclarativeCoverActionList::removeEntries(payload, QStringLiteral("org.quorvaneos.coveraction.pid7.id1")), expected);
    }

    void changesArePublishedTogether()
    {
        QQuickWindow *window = recordedWindow();
        QVERIFY(window);
        const QStringList &published = m_payloads;
        auto list = new DeclarativeCoverActionList; // wayland is decided at construction
        m_made << list;
        list->setWindow(window);
        auto action = new DeclarativeCoverAction(list);
        action->setIconSource(QUrl(QStringLiteral("image://theme/a")));
        list->appendAction(action);
        list->setIconBackground(true);
        list->componentComplete();
        QTRY_COMPARE(published.size(), 1);
        QTest::qWait(30);
        QCOMPARE(published.size(), 1);
        QVERIFY(published.first().endsWith(QLatin1String("\n0\nimage://theme/a\n1")));

        // Disabled: its entries are taken out of the window's payload, and the log says so.
        QLoggingCategory::setFilterRules(QStringLiteral("org.quorvaneos.pelkan.cover.debug=true"));
        s_messages.clear();
        const QtMessageHandler previous = qInstallMessageHandler(collectMessages);
        list->setEnabled(false);
        QTRY_COMPARE(published.size(), 2);
        qInstallMessageHandler(previous);
        QLoggingCategory::setFilterRules(QString());
        QCOMPARE(published.last(), QString());
        QVERIFY2(!s_messages.filter(QRegularExpression(QStringLiteral("^disableActiveCovers, process: %1, winId: [1-9]\\d*, action count: 1, enabled: 0$")
                                                               .arg(QCoreApplication::applicationPid()))).isEmpty(),
                 qPrintable(s_messages.join('\n')));
    }

    void windowShowsTheLatestEnabledList_data()
    {
        QTest::addColumn<QString>("change");
        QTest::addColumn<int>("shown"); // which list's entries the window ends with, -1 for none
        QTest::newRow("both enabled: the later one") << "" << 1;
        QTest::newRow("later one disabled") << "disable 1" << 0;
        QTest::newRow("earlier one disabled") << "disable 0" << 1;
        QTest::newRow("both disabled") << "disable 0,disable 1" << -1;
        QTest::newRow("later one emptied") << "empty 1" << 0;
        QTest::newRow("later one's actions destroyed") << "destroy actions 1" << 0;
        QTest::newRow("later one destroyed") << "destroy 1" << 0;
        QTest::newRow("earlier one re-enabled") << "disable 0,enable 0" << 0;
        QTest::newRow("earlier one's icon changes") << "icon 0" << 1;
        QTest::newRow("all emptied") << "empty 0,empty 1" << -1;
    }

    void windowShowsTheLatestEnabledList()
    {
        QFETCH(QString, change);
        QFETCH(int, shown);
        QQuickWindow *window = recordedWindow();
        QVERIFY(window);
        QVector<DeclarativeCoverActionList *> lists;
        for (int i = 0; i < 2; ++i) {
            lists << makeList(2);
            lists.last()->setWindow(window);
        }
        QTRY_VERIFY(m_payloads.value(m_payloads.size() - 1).startsWith(lists.at(1)->serviceName()));

        for (const QString &step : change.split(QLatin1Char(','), Qt::SkipEmptyParts)) {
            DeclarativeCoverActionList *list = lists.at(step.right(1).toInt());
            if (step.startsWith(QLatin1String("disable")))
                list->setEnabled(false);
            else if (step.startsWith(QLatin1String("enable")))
                list->setEnabled(true);
            else if (step.startsWith(QLatin1String("empty")))
                list->clearActions();
            else if (step.startsWith(QLatin1String("destroy actions")))
                qDeleteAll(QVector<DeclarativeCoverAction *>(list->actionList()));
            else if (step.startsWith(QLatin1String("icon")))
                list->actionList().first()->setIconSource(QUrl(QStringLiteral("image://theme/changed")));
            else if (step.startsWith(QLatin1String("destroy"))) {
                m_made.removeOne(list);
                delete list;
            }
            QTest::qWait(20);
        }
        QTest::qWait(30);
        const QString published = m_payloads.last();
        if (shown < 0) {
            QCOMPARE(published, QString());
        } else {
            // Straight from one list's entries to the other's, never an empty set between.
            QVERIFY(!m_payloads.contains(QString()));
            const QStringList lines = published.split(QLatin1Char('\n'));
            QCOMPARE(lines.size(), 9);
            QCOMPARE(lines.at(0), lists.at(shown)->serviceName());
            QCOMPARE(lines.at(4), lists.at(shown)->serviceName());
        }
    }

    // A window without a native handle gets nothing; setting the same window again changes
    // nothing; a destroyed window is announced.
    void windowWithoutAHandleAndDestroyed()
    {
        QVERIFY(recordedWindow());
        DeclarativeCoverActionList *list = makeList(1);
        auto window = new QQuickWindow;
        list->setWindow(window);
        QSignalSpy changed(list, &DeclarativeCoverActionList::windowChanged);
        list->setWindow(window);
        QTest::qWait(30);
        QCOMPARE(m_payloads, QStringList());
        QVERIFY(!window->handle());
        delete window;
        QCOMPARE(changed.count(), 1);
        QCOMPARE(list->window(), nullptr);
    }

    // The log's texts stand exactly as given: no quotes around them, and a refused bus name
    // says what the bus said.
    void logTextsAsGiven()
    {
        QLoggingCategory::setFilterRules(QStringLiteral("org.quorvaneos.pelkan.cover.debug=true"));
        s_messages.clear();
        const QtMessageHandler previous = qInstallMessageHandler(collectMessages);
        DeclarativeCoverActionList *first = makeList(1);
        // A name another connection holds is refused.
        const QString next = first->serviceName().section(QLatin1String(".id"), 0, 0) + QStringLiteral(".id%1")
                                     .arg(first->serviceName().section(QLatin1String(".id"), 1).toInt() + 1);
        QVERIFY(QDBusConnection::connectToBus(m_address, QStringLiteral("squatter")).registerService(next));
        QVERIFY(!makeList(1)->isRegistered());
        QDBusConnection::disconnectFromBus(QStringLiteral("squatter"));
        // Each connection may own 40 names here: the lists past that are refused by the bus.
        for (int i = 0; i < 40; ++i)
            makeList(1);
        qInstallMessageHandler(previous);
        QLoggingCategory::setFilterRules(QString());

        QVERIFY2(s_messages.contains(QStringLiteral("dbus ready ") + first->serviceName()), qPrintable(s_messages.join('\n')));
        const QStringList refused = s_messages.filter(QStringLiteral("Failed to register service"));
        QVERIFY2(refused.size() >= 2 && refused.first().startsWith(QStringLiteral("Failed to register service: %1, error ").arg(next)),
                 qPrintable(s_messages.join('\n')));
        QVERIFY2(refused.last().contains(QRegularExpression(QStringLiteral(
                         "^Failed to register service: org\\.quorvaneos\\.coveraction\\.pid\\d+\\.id\\d+, "
                         "error org\\.freedesktop\\.DBus\\.Error\\.LimitsExceeded: \\S"))),
                 qPrintable(refused.last()));
    }

private:
    DeclarativeCoverActionList *makeList(int actions);

    // A shown window whose cover-action payloads are recorded, as on wayland.
    QQuickWindow *recordedWindow()
    {
        m_payloads.clear();
        WindowPropertyPublisher::setSinkForTesting([this](QWindow *, const QString &name, const QVariant &value) {
            if (name == QLatin1String("_APP_COVER_ACTION"))
                m_payloads << value.toString();
        }, QStringLiteral("wayland"));
        m_window.reset(new QQuickWindow);
        m_window->show();
        return QTest::qWaitForWindowExposed(m_window.data()) ? m_window.data() : nullptr;
    }
    QScopedPointer<QQuickWindow> m_window;
    QStringList m_payloads;

    QTemporaryDir m_busDir;
    QProcess m_bus;
    QString m_address;
    QObjectList m_made;
};

DeclarativeCoverActionList *tst_DeclarativeCoverActionList::makeList(int actions)
{
    auto list = new DeclarativeCoverActionList;
    m_made << list;
    for (int i = 0; i < actions; ++i) {
        auto action = new DeclarativeCoverAction(list);
        action->setIconSource(QUrl(QStringLiteral("image://theme/icon-cover-%1").arg(i)));
        list->appendAction(action);
    }
    list->componentComplete();
    return list;
}

QTEST_MAIN(tst_DeclarativeCoverActionList)
#include "tst_declarativecoveractionlist.moc"
