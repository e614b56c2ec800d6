#include "../common/configfixture.h"

#include <QColor>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QtTest>

// Each module has a Theme object of its own, and palettes follow the process theme: all
// of them tell the same, at every moment, also while the configuration changes under a
// running application.
class tst_Themes : public QObject
{
    Q_OBJECT

public Q_SLOTS:
    void compareAll();

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase() { ConfigFixture::reset(path()); }
    void agreeThroughLiveChanges_data();
    void agreeThroughLiveChanges();

private:
    static QString path() { return QStringLiteral("/desktop/quorvane/pelkan/theme/"); }
    QStringList differences() const;

    QQmlEngine m_engine;
    QScopedPointer<QObject> m_root;
    QObject *m_public = nullptr;
    QObject *m_module = nullptr;
    QObject *m_palette = nullptr;
    QStringList m_seen; // differences seen while something changed
};

void tst_Themes::initTestCase()
{
    QVERIFY(ConfigFixture::reset(path()));
    QQmlComponent component(&m_engine);
    component.setData("import QtQml 2.2\n"
                      "import Quorvane.Pelkan 1.0 as Public\n"
                      "import Quorvane.Pelkan.theme 1.0 as Module\n"
                      "QtObject {\n"
                      "  property QtObject publicTheme: Public.Theme\n"
                      "  property QtObject moduleTheme: Module.Theme\n"
                      "  property QtObject palette: Public.Palette {}\n"
                      "}\n", QUrl());
    m_root.reset(component.create());
    QVERIFY2(m_root, qPrintable(component.errorString()));
    m_public = m_root->property("publicTheme").value<QObject *>();
    m_module = m_root->property("moduleTheme").value<QObject *>();
    m_palette = m_root->property("palette").value<QObject *>();
    QVERIFY(m_public && m_module && m_palette);
    QVERIFY(m_public != m_module); // one object per module
    QVERIFY(m_public->property("errorColor").value<QColor>().isValid());
    QVERIFY(m_public->property("backgroundColor").value<QColor>().isValid());

    // Whatever announces a change, everything must agree when it does.
    const int check = metaObject()->indexOfSlot("compareAll()");
    for (QObject *object : { m_public, m_module, m_palette }) {
        const QMetaObject *meta = object->metaObject();
        for (int i = QObject::staticMetaObject.propertyCount(); i < meta->propertyCount(); ++i) {
            if (meta->property(i).hasNotifySignal())
                QMetaObject::connect(object, meta->property(i).notifySignalIndex(), this, check);
        }
    }
}

QStringList tst_Themes::differences() const
{
    QStringList found;
    const QMetaObject *meta = m_public->metaObject();
    for (int i = QObject::staticMetaObject.propertyCount(); i < meta->propertyCount(); ++i) {
        const char *name = meta->property(i).name();
        const QVariant value = m_public->property(name);
        if (value != m_module->property(name))
            found << QStringLiteral("module %1: %2 / %3").arg(name, value.toString(), m_module->property(name).toString());
        const QVariant inPalette = m_palette->property(name);
        if (inPalette.isValid() && name != QByteArray("colorScheme") && inPalette != value)
            found << QStringLiteral("palette %1: %2 / %3").arg(name, value.toString(), inPalette.toString());
    }
    return found;
}

void tst_Themes::compareAll()
{
    m_seen += differences();
}

void tst_Themes::agreeThroughLiveChanges_data()
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

void tst_Themes::agreeThroughLiveChanges()
{
    QFETCH(QString, key);
    QFETCH(QString, value);
    QFETCH(QByteArray, property);
    const QVariant before = m_public->property(property);
    m_seen.clear();
    QVERIFY(ConfigFixture::write(path() + key, value));
    QTRY_VERIFY(m_public->property(property) != before);
    QTRY_VERIFY(differences().isEmpty());
    QVERIFY(ConfigFixture::reset(path() + key));
    QTRY_COMPARE(m_public->property(property), before);
    QTRY_VERIFY(differences().isEmpty());
    QVERIFY2(m_seen.isEmpty(), qPrintable(m_seen.join(QLatin1Char('\n'))));
}

QTEST_MAIN(tst_Themes)
#include "tst_themes.moc"
