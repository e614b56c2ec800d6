#include "text/declarativeformatter.h"
#include "text/formatterseams.h"
#include "text/formattingproxymodel.h"

#include <QStandardItemModel>
#include <QTranslator>
#include <QtTest>

static const QDateTime Now(QDate(2026, 3, 15), QTime(12, 0));

enum SourceRoles { ModifiedRole = Qt::UserRole + 1, SizeRole, NameRole };

class tst_FormattingProxyModel : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_catalogue.load(QStringLiteral("quorvanepelkan-qt5_eng_en"), QStringLiteral(CATALOGUE_DIR)));
        QCoreApplication::installTranslator(&m_catalogue);
        FormatterSeams::setCurrentDateTimeForTesting(Now);
        m_source.setItemRoleNames({ { ModifiedRole, "modified" }, { SizeRole, "size" }, { NameRole, "name" } });
        m_proxy.setSourceModel(&m_source);
        m_proxy.setFormats({ format("modifiedText", "modified", "formatDate", DeclarativeFormatter::DurationElapsed),
                             format("sizeText", "size", "formatFileSize"),
                             format("lengthText", "size", "formatDuration", DeclarativeFormatter::DurationLong),
                             format("safeName", "name", "formatText", DeclarativeFormatter::PortableFilename) });
    }

    void init()
    {
        m_source.clear();
        auto item = new QStandardItem;
        item->setData(Now.addSecs(-3 * 60), ModifiedRole);
        item->setData(qlonglong(1536), SizeRole);
        item->setData(QStringLiteral("Holiday photo (2).jpg"), NameRole);
        m_source.appendRow(item);
    }

    void formattedRoles_data()
    {
        QTest::addColumn<QByteArray>("role");
        QTest::addColumn<QString>("expected");
        QTest::newRow("date") << QByteArray("modifiedText") << "3 minutes ago";
        QTest::newRow("file size, default precision") << QByteArray("sizeText") << "1.5 kB";
        QTest::newRow("duration from a number") << QByteArray("lengthText") << "0:25:36";
        QTest::newRow("text") << QByteArray("safeName") << "Holidayphoto2.jpg";
    }

    void formattedRoles()
    {
        QFETCH(QByteArray, role);
        QFETCH(QString, expected);
        const int id = roleNamed(role);
        QVERIFY(id > NameRole);
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), id).toString(), expected);
        // Source roles pass through untouched.
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), SizeRole), QVariant(qlonglong(1536)));
    }

    void sourceChangesReachFormattedRoles()
    {
        QSignalSpy changed(&m_proxy, &QAbstractItemModel::dataChanged);
        m_source.item(0)->setData(qlonglong(3 * 1048576), SizeRole);

        QVector<int> announced;
        for (const QList<QVariant> &arguments : qAsConst(changed))
            announced += arguments.at(2).value<QVector<int>>();
        QVERIFY(announced.contains(roleNamed("sizeText")));
        QVERIFY(announced.contains(roleNamed("lengthText")));
        QVERIFY(!announced.contains(roleNamed("modifiedText")));
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), roleNamed("sizeText")).toString(), QStringLiteral("3.0 MB"));
    }

    void refreshAnnouncesEveryFormattedRole()
    {
        QSignalSpy changed(&m_proxy, &QAbstractItemModel::dataChanged);
        FormatterSeams::setCurrentDateTimeForTesting(Now.addSecs(60 * 60));
        m_proxy.refresh();
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.first().at(2).value<QVector<int>>().size(), 4);
        QCOMPARE(m_proxy.data(m_proxy.index(0, 0), roleNamed("modifiedText")).toString(), QStringLiteral("1 hour ago"));
        FormatterSeams::setCurrentDateTimeForTesting(Now);
    }

    void badFormatsAreIgnored()
    {
        FormattingProxyModel proxy;
        QStandardItemModel source;
        source.setItemRoleNames({ { NameRole, "name" } });
        source.appendRow(new QStandardItem(QStringLiteral("x")));
        proxy.setSourceModel(&source);

        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^FormattingProxyModel: ignoring format")));
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^FormattingProxyModel: ignoring format")));
        proxy.setFormats({ format("a", "name", "formatNothing"), format("", "name", "formatText"),
                           format("b", "missing", "formatText"), format("c", "name", "formatText") });
        const QHash<int, QByteArray> roles = proxy.roleNames();
        QVERIFY(!roles.values().contains("a"));
        QVERIFY(roles.values().contains("b"));
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("^FormattingProxyModel: the source model has no role \"missing\"")));
        QCOMPARE(proxy.data(proxy.index(0, 0), roles.key("b")), QVariant());
        QCOMPARE(proxy.data(proxy.index(0, 0), roles.key("b")), QVariant()); // warned once
        QCOMPARE(proxy.data(proxy.index(0, 0), roles.key("c")).toString(), QString());
    }

private:
    static QVariantMap format(const char *role, const char *source, const char *operation, QVariant argument = QVariant())
    {
        QVariantMap map { { QStringLiteral("role"), QString::fromLatin1(role) },
                          { QStringLiteral("source"), QString::fromLatin1(source) },
                          { QStringLiteral("operation"), QString::fromLatin1(operation) } };
        if (argument.isValid())
            map.insert(QStringLiteral("argument"), argument);
        return map;
    }

    int roleNamed(const QByteArray &name) const { return m_proxy.roleNames().key(name, -1); }

    QTranslator m_catalogue;
    QStandardItemModel m_source;
    FormattingProxyModel m_proxy;
};

QTEST_GUILESS_MAIN(tst_FormattingProxyModel)
#include "tst_formattingproxymodel.moc"
