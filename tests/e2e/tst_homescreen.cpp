#include "homescreensession.h"

#include <QJsonArray>
#include <QtTest>

#include <cerrno>
#include <grp.h>
#include <signal.h>
#include <unistd.h>

// Applications run under the reference home screen as wayland clients: what they publish
// is read off the compositor's side of the connection, and what the home screen does
// (pressing cover actions, sending keys) is seen in the application's log.
class tst_HomeScreen : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void windowProperties_data()
    {
        QTest::addColumn<QStringList>("properties");
        QTest::addColumn<QStringList>("expected");
        QTest::addColumn<QStringList>("coverExpected");
        const QStringList common { "BACKGROUND_VISIBLE", "WINID", "QUORVANE_COVER_WINDOW", "QUORVANE_HAVE_COVER" };
        QTest::newRow("category") << QStringList { "category=true" } << common + QStringList { "CATEGORY", "WINDOW_OPACITY" }
                                  << QStringList { "TRANSPARENT", "WINID", "CATEGORY", "QUORVANE_COVER_WINDOW", "QUORVANE_APPLICATION_WINDOW" };
        QTest::newRow("no category") << QStringList { "category=false" } << common + QStringList { "WINDOW_OPACITY" }
                                     << QStringList { "TRANSPARENT", "WINID", "CATEGORY" };
        QTest::newRow("background rectangle") << QStringList { "category=false", "backgroundHeight=50" }
                                              << common + QStringList { "WINDOW_OPACITY", "BACKGROUND_RECT" }
                                              << QStringList { "TRANSPARENT", "WINID", "CATEGORY" };
    }

    // What the application window and its cover window publish, and how they pair.
    void windowProperties()
    {
        QFETCH(QStringList, properties);
        QFETCH(QStringList, expected);
        QFETCH(QStringList, coverExpected);
        const bool category = expected.contains(QLatin1String("CATEGORY"));
        HomeScreenSession session;
        QVERIFY(run(session, properties));

        const int application = session.surfaceWith(QStringLiteral("BACKGROUND_VISIBLE"));
        QVERIFY(session.waitForPropertySequence(application, expected));
        // Each publication sends the whole set in the same order; the window may publish
        // more than once (when shown, when its cover arrives). Other properties of the
        // window (the cover actions, keeping the cover) come on their own.
        QStringList published;
        for (const QJsonObject &record : session.properties(application)) {
            if (name(record) != QLatin1String("_APP_COVER_ACTION") && name(record) != QLatin1String("QUORVANE_RETAIN_COVER"))
                published << name(record);
        }
        QCOMPARE(published.size() % expected.size(), 0);
        for (int i = 0; i < published.size(); i += expected.size())
            QCOMPARE(published.mid(i, expected.size()), expected);

        const QJsonObject visible = session.lastProperty(application, QStringLiteral("BACKGROUND_VISIBLE"));
        QCOMPARE(visible.value(QLatin1String("type")).toString(), QStringLiteral("bool"));
        QCOMPARE(value(visible), QStringLiteral("true"));
        QCOMPARE(value(session.lastProperty(application, QStringLiteral("WINDOW_OPACITY"))), QStringLiteral("1"));
        QCOMPARE(session.lastProperty(application, QStringLiteral("WINID")).value(QLatin1String("type")).toString(),
                 QStringLiteral("qulonglong"));
        if (category)
            QCOMPARE(value(session.lastProperty(application, QStringLiteral("CATEGORY"))), QStringLiteral("pelkan"));
        if (expected.contains(QLatin1String("BACKGROUND_RECT")))
            QCOMPARE(value(session.lastProperty(application, QStringLiteral("BACKGROUND_RECT"))), QStringLiteral("0,10,270,50"));

        // The cover's properties arrive together, but not necessarily with its category.
        QVERIFY(!session.waitFor([](const QJsonObject &r) {
            return r.value(QLatin1String("event")) == QLatin1String("property") && name(r) == QLatin1String("TRANSPARENT");
        }).isEmpty());
        const int cover = session.surfaceWith(QStringLiteral("TRANSPARENT"));
        QVERIFY(cover != 0 && cover != application);
        // Properties set before the compositor's side of a window exists reach it all at
        // once, sorted by name, when it is made; the window's own publication keeps order.
        QVERIFY(session.waitForPropertySequence(cover, coverExpected));
        QCOMPARE(value(session.lastProperty(cover, QStringLiteral("TRANSPARENT"))), QStringLiteral("true"));
        QCOMPARE(value(session.lastProperty(cover, QStringLiteral("CATEGORY"))),
                 category ? QStringLiteral("pelkan-cover") : QStringLiteral("cover"));

        // Each window names the other by the id the other published as its own.
        const QString coverId = value(session.lastProperty(cover, QStringLiteral("WINID")));
        const QString applicationId = value(session.lastProperty(application, QStringLiteral("WINID")));
        QVERIFY(!coverId.isEmpty() && coverId != applicationId);
        QCOMPARE(value(session.lastProperty(application, QStringLiteral("QUORVANE_COVER_WINDOW"))), coverId);
        if (category) {
            QCOMPARE(value(session.lastProperty(cover, QStringLiteral("QUORVANE_COVER_WINDOW"))), coverId);
            QCOMPARE(value(session.lastProperty(cover, QStringLiteral("QUORVANE_APPLICATION_WINDOW"))), applicationId);
            const QJsonObject paired = session.waitForEvent(QStringLiteral("paired"));
            QCOMPARE(paired.value(QLatin1String("application")).toInt(), application);
            QCOMPARE(paired.value(QLatin1String("cover")).toInt(), cover);
        } else {
            QVERIFY(session.lastProperty(cover, QStringLiteral("QUORVANE_APPLICATION_WINDOW")).isEmpty());
            QVERIFY(session.waitForEvent(QStringLiteral("paired"), 300).isEmpty());
        }
    }

    void coverActionsEndToEnd()
    {
        HomeScreenSession session;
        QVERIFY(run(session, {}));

        const QJsonObject published = session.waitForEvent(QStringLiteral("coverActions"));
        const QJsonArray actions = published.value(QLatin1String("actions")).toArray();
        QCOMPARE(actions.size(), 2);
        QCOMPARE(published.value(QLatin1String("surface")).toInt(), session.surfaceWith(QStringLiteral("BACKGROUND_VISIBLE")));
        const QString service = actions.at(0).toObject().value(QLatin1String("service")).toString();
        QVERIFY(service.startsWith(QLatin1String("org.quorvaneos.coveraction.pid")));

        const QStringList lines = value(session.lastProperty(published.value(QLatin1String("surface")).toInt(),
                                                             QStringLiteral("_APP_COVER_ACTION"))).split(QLatin1Char('\n'));
        QCOMPARE(lines, QStringList({ service, "trigger", "0", "image://theme/icon-cover-pause",
                                      service, "trigger", "1", "image://theme/icon-cover-next", "0" }));

        // The home screen presses the second action: the second action fires, and only it.
        session.send(QStringLiteral("trigger 1"));
        const QJsonObject reply = session.waitForEvent(QStringLiteral("triggered"));
        QCOMPARE(reply.value(QLatin1String("index")).toInt(), 1);
        if (!privilegedHere()) {
            QCOMPARE(reply.value(QLatin1String("error")).toString(), QStringLiteral("org.freedesktop.DBus.Error.AccessDenied"));
            QCOMPARE(reply.value(QLatin1String("message")).toString(),
                     QStringLiteral("PID %1 is not in privileged group").arg(session.homeScreenPid()));
            QSKIP("the home screen is not privileged here: presses are refused, as they must be");
        }
        QCOMPARE(reply.value(QLatin1String("error")).toString(), QString());
        QVERIFY(session.waitForLog(QStringLiteral("e2e: action 1")));
        QVERIFY(!session.log().contains(QLatin1String("e2e: action 0")));
    }

    // The components on the device: the Back key pops the top page with its statuses in
    // order, then, with one page left, lowers the window.
    void backKeyThroughThePageStack()
    {
        QList<qint64> pids;
        {
            HomeScreenSession session;
            QVERIFY(session.start(QStringLiteral(PELKAN_E2E_DATA "/pages.qml"), {}));
            QVERIFY(session.waitForLog(QStringLiteral("e2e: second page active")));
            QVERIFY(!session.waitFor([](const QJsonObject &r) {
                return r.value(QLatin1String("event")) == QLatin1String("property") && name(r) == QLatin1String("BACKGROUND_VISIBLE");
            }).isEmpty());
            const int application = session.surfaceWith(QStringLiteral("BACKGROUND_VISIBLE"));
            session.send(QStringLiteral("focus"));
            QVERIFY(session.waitForLog(QStringLiteral("e2e: active true")));

            session.send(QStringLiteral("key back"));
            QVERIFY(session.waitForLog(QStringLiteral("e2e: second page inactive")));
            const QString log = session.log();
            QVERIFY(log.contains(QLatin1String("e2e: depth 1")));
            QVERIFY2(log.indexOf(QLatin1String("e2e: second page deactivating")) < log.indexOf(QLatin1String("e2e: second page inactive")),
                     qPrintable(log.right(400)));
            session.send(QStringLiteral("key back"));
            QCOMPARE(session.waitForEvent(QStringLiteral("lower")).value(QLatin1String("surface")).toInt(), application);
            pids = session.startedPids();
        }
        // Everything the session started is gone with it, reaped.
        for (qint64 pid : qAsConst(pids))
            QVERIFY2(pid > 0 && ::kill(pid_t(pid), 0) == -1 && errno == ESRCH, qPrintable(QString::number(pid)));
    }

private:
    static QString application() { return QStringLiteral(PELKAN_E2E_DATA "/application.qml"); }
    // Starts a session running the application and waits until both of its windows have
    // published their properties.
    bool run(HomeScreenSession &session, const QStringList &properties);
    static QString name(const QJsonObject &record) { return record.value(QLatin1String("name")).toString(); }
    static QString value(const QJsonObject &record) { return record.value(QLatin1String("value")).toString(); }
    static bool privilegedHere();
};

bool tst_HomeScreen::run(HomeScreenSession &session, const QStringList &properties)
{
    if (!session.start(application(), properties))
        return false;
    // The cover window's category closes its publication.
    return !session.waitFor([](const QJsonObject &r) {
        return r.value(QLatin1String("event")) == QLatin1String("property") && name(r) == QLatin1String("CATEGORY")
                && value(r).contains(QLatin1String("cover"));
    }).isEmpty() && session.surfaceWith(QStringLiteral("BACKGROUND_VISIBLE")) != 0;
}

bool tst_HomeScreen::privilegedHere()
{
    const group *privileged = getgrnam("privileged");
    return getuid() == 0 || (privileged && getegid() == privileged->gr_gid);
}

QTEST_GUILESS_MAIN(tst_HomeScreen)
#include "tst_homescreen.moc"
