#include "../common/configfixture.h"

#include <QColor>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QtTest>

// Each module has a Theme object of its own and palettes follow the process theme: all
// of them tell the same at every change signal, while the configuration changes under a
// running application.
class tst_Themes : public QObject
{
    Q_OBJECT

public Q_SLOTS:
    void compareAll()
    {
        const QMetaObject *meta = m_objects[0]->metaObject();
        for (int i = QObject::staticMetaObject.propertyCount(); i < meta->propertyCount(); ++i) {
            const char *name = meta->property(i).name();
            const QVariant value = m_objects[0]->property(name);
            for (QObject *other : { m_objects[1], m_objects[2] }) {
                const QVariant seen = other->property(name); // a palette has the colours only
                if (seen.isValid() && seen.userType() == value.userType() && seen != value)
                    m_differences << QStringLiteral("%1: %2 / %3").arg(name, value.toString(), seen.toString());
            }
        }
    }

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(ConfigFixture::reset(Path));
        QQmlComponent component(&m_engine);
        component.setData("import QtQml 2.2\nimport Quorvane.Pelkan 1.0 as Public\nimport Quorvane.Pelkan.theme 1.0 as Module\n"
                          "QtObject { property var all: [Public.Theme, Module.Theme, palette]\n"
                          "  property QtObject palette: Public.Palette {} }\n", QUrl());
        m_root.reset(component.create());
        QVERIFY2(m_root, qPrintable(component.errorString()));
        const QVariantList all = m_root->property("all").toList();
        for (int i = 0; i < 3; ++i)
            QVERIFY(m_objects[i] = all.at(i).value<QObject *>());
        QVERIFY(m_objects[0] != m_objects[1]);
        const int check = metaObject()->indexOfSlot("compareAll()");
        for (QObject *object : m_objects) {
            for (int i = QObject::staticMetaObject.propertyCount(); i < object->metaObject()->propertyCount(); ++i) {
                if (object->metaObject()->property(i).hasNotifySignal())
                    QMetaObject::connect(object, object->metaObject()->property(i).notifySignalIndex(), this, check);
            }
        }
    }
    void cleanupTestCase() { ConfigFixture::reset(Path); }

    void agreeThroughLiveChanges_data()
    {
        QTest::addColumn<QString>("key");
        QTest::addColumn<QString>("value");
        QTest::addColumn<QByteArray>("property"); // one that changes with it
        QTest::newRow("colour scheme") << "color_scheme" << "'darkonlight'" << QByteArray("backgroundColor");
        QTest::newRow("error colour") << "error_color" << "'#123456'" << QByteArray("errorColor");
        QTest::newRow("background colour") << "background_color" << "'#abcdef'" << QByteArray("backgroundColor");
        QTest::newRow("highlight colour") << "highlight_color" << "'#00ff00'" << QByteArray("secondaryHighlightColor");
        QTest::newRow("pixel ratio") << "pixel_ratio" << "2.5" << QByteArray("itemSizeSmall");
    }

    void agreeThroughLiveChanges()
    {
        QFETCH(QString, key);
        QFETCH(QString, value);
        QFETCH(QByteArray, property);
        QObject *theme = m_objects[0];
        const QVariant before = theme->property(property);
        m_differences.clear();
        QVERIFY(ConfigFixture::write(Path + key, value));
        QTRY_VERIFY(theme->property(property) != before);
        QVERIFY(ConfigFixture::reset(Path + key));
        QTRY_COMPARE(theme->property(property), before);
        compareAll();
        QVERIFY2(m_differences.isEmpty(), qPrintable(m_differences.join(QLatin1Char('\n'))));
    }

private:
    const QString Path = QStringLiteral("/desktop/quorvane/pelkan/theme/");
    QQmlEngine m_engine;
    QScopedPointer<QObject> m_root;
    QObject *m_objects[3] = {}; // the public module's Theme, the theme module's, a palette
    QStringList m_differences;
};

QTEST_MAIN(tst_Themes)
#include "tst_themes.moc"
