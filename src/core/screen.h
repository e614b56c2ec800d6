#pragma once

#include <QObject>
#include <QPointer>

class MGConfItem;
class QScreen;

namespace Pelkan {

// The device's display, always described in portrait: width is the short side and
// height the long side, in physical pixels. The size category comes from the physical
// diagonal, which the configuration key "/desktop/quorvane/pelkan/screen/diagonal"
// (inches) overrides for devices whose display reports no usable physical size.
class Screen : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int width READ width NOTIFY geometryChanged)
    Q_PROPERTY(int height READ height NOTIFY geometryChanged)
    Q_PROPERTY(qreal widthRatio READ widthRatio NOTIFY geometryChanged)
    Q_PROPERTY(qreal diagonal READ diagonal NOTIFY sizeCategoryChanged)
    Q_PROPERTY(SizeCategory sizeCategory READ sizeCategory NOTIFY sizeCategoryChanged)

public:
    // Anything above Medium is a large screen: tablets and bigger.
    enum SizeCategory { Small, Medium, Large, ExtraLarge };
    Q_ENUM(SizeCategory)

    static constexpr int ReferenceWidth = 540;

    static Screen *instance();

    explicit Screen(QObject *parent = nullptr);
    ~Screen() override;

    int width() const { return m_width; }
    int height() const { return m_height; }
    qreal widthRatio() const { return qreal(m_width) / ReferenceWidth; }
    qreal diagonal() const { return m_diagonal; }
    SizeCategory sizeCategory() const;

    // Category of a display with the given diagonal in inches.
    static SizeCategory categoryForDiagonal(qreal inches);

Q_SIGNALS:
    void geometryChanged();
    void sizeCategoryChanged();

private:
    void trackScreen(QScreen *screen);
    void update();

    MGConfItem *m_diagonalConfig;
    QPointer<QScreen> m_screen;
    int m_width = ReferenceWidth;
    int m_height = 960;
    qreal m_diagonal = 5.0;
};

} // namespace Pelkan
