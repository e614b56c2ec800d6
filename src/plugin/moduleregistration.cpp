#include "moduleregistration.h"

#include "core/coreregistration.h"
#include "text/autofill.h"
#include "layout/autoscrollcontroller.h"
#include "layout/buttonlayout.h"
#include "text/declarativetextbaseitem.h"
#include "rendering/backgrounds/declarativeunderline.h"
#include "text/declarativevariantinterpolator.h"
#include "layout/horizontalautoscroll.h"
#include "text/stringlistmodel.h"
#include "text/textlayoutmodel.h"
#include "layout/verticalautoscroll.h"
#include "rendering/blur/blureffect.h"
#include "rendering/backgrounds/bubblebackgrounditem.h"
#include "rendering/backgrounds/glassbackground.h"
#include "rendering/overlay/overlaybackground.h"
#include "rendering/overlay/overlaybackgroundsource.h"
#include "rendering/backgrounds/overlaygradient.h"
#include "gestures/declarativebounceeffect.h"
#include "services/declarativeclipboard.h"
#include "services/declarativeconfigapi.h"
#include "services/declarativeutil.h"
#include "window/declarativecover.h"
#include "rendering/backgrounds/declarativedimmedregion.h"
#include "window/declarativecoveraction.h"
#include "window/declarativecoveractionlist.h"
#include "window/declarativecoverwindow.h"
#include "gestures/declarativedragfilter.h"
#include "text/declarativeenterkey.h"
#include "text/declarativeformatter.h"
#include "rendering/glass/declarativeglassitem.h"
#include "text/declarativepreedittext.h"
#include "gestures/declarativepagestackbase.h"
#include "services/declarativestandardpaths.h"
#include "gestures/declarativetouchblocker.h"
#include "lists/declarativequickscrollbuttonbase.h"
#include "lists/declarativevisibilitycull.h"
#include "gestures/dragdetectoritem.h"
#include "lists/remorsecache.h"
#include "views/slide.h"
#include "views/slideable.h"
#include "window/declarativewindow.h"
#include "text/formattingproxymodel.h"
#include "gestures/minversemousearea.h"
#include "gestures/pulleymenulogic.h"
#include "core/palette.h"
#include "core/screen.h"
#include "core/theme.h"
#include "core/touchfeedback.h"

#include "enums/declarativebusyindicatorsize.h"
#include "enums/declarativedatetime.h"
#include "enums/declarativedialogresult.h"
#include "enums/declarativedialogstatus.h"
#include "enums/declarativedock.h"
#include "enums/declarativefocusbehavior.h"
#include "enums/declarativeopacityramp.h"
#include "enums/declarativeorientation.h"
#include "enums/declarativepagenavigation.h"
#include "enums/declarativepagestackaction.h"
#include "enums/declarativepagestatus.h"
#include "enums/declarativetabviewaction.h"
#include "enums/declarativetouchinteraction.h"
#include "enums/declarativetruncationmode.h"
#include "enums/timepickermode.h"

#include <QAbstractItemModel>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>

namespace {

template <typename T>
int registerSingleton(const char *uri, const char *name)
{
    return qmlRegisterSingletonType<T>(uri, 1, 0, name, [](QQmlEngine *, QJSEngine *) -> QObject * {
        return new T;
    });
}

// Controls play their touch tone through the engine's Util, which knows the sound profile.
int s_utilType = -1;

void playTouchFeedback(QQuickItem *pressed)
{
    QQmlEngine *engine = qmlEngine(pressed);
    if (!engine || s_utilType < 0)
        return;
    if (auto util = engine->singletonInstance<DeclarativeUtil *>(s_utilType))
        util->playTouchFeedback();
}

template <typename T>
void registerUncreatable(const char *uri, const char *name)
{
    qmlRegisterUncreatableType<T>(uri, 1, 0, name, QString());
}

} // namespace

namespace ModuleRegistration {

void registerPublicModule(const char *uri)
{
    Pelkan::Private::registerTypes(uri);
    qmlRegisterRevision<QQuickItem, 1>(uri, 1, 0);
    registerSingleton<Pelkan::Theme>(uri, "Theme");
    registerSingleton<DeclarativeFormatter>(uri, "Format");
    registerSingleton<Pelkan::Screen>(uri, "Screen");
    registerSingleton<DeclarativeStandardPaths>(uri, "StandardPaths");
    registerSingleton<DeclarativeClipboard>(uri, "Clipboard");
    registerUncreatable<DeclarativePageStatus>(uri, "PageStatus");
    registerUncreatable<DeclarativePageNavigation>(uri, "PageNavigation");
    registerUncreatable<DeclarativeDialogStatus>(uri, "DialogStatus");
    registerUncreatable<DeclarativeDialogResult>(uri, "DialogResult");
    registerUncreatable<DeclarativeFocusBehavior>(uri, "FocusBehavior");
    registerUncreatable<DeclarativeOpacityRamp>(uri, "OpacityRamp");
    registerUncreatable<DeclarativeTouchInteraction>(uri, "TouchInteraction");
    registerUncreatable<DeclarativeOrientation>(uri, "Orientation");
    registerUncreatable<DeclarativeTruncationMode>(uri, "TruncationMode");
    registerUncreatable<DeclarativeDateTime>(uri, "DateTime");
    registerUncreatable<DeclarativePageStackAction>(uri, "PageStackAction");
    registerUncreatable<DeclarativeTabViewAction>(uri, "TabViewAction");
    registerUncreatable<DeclarativeDock>(uri, "Dock");
    registerUncreatable<DeclarativeEnterKey>(uri, "EnterKey");
    qmlRegisterType<DeclarativePageStackBase>(uri, 1, 0, "PageStackBase");
    qmlRegisterType<DeclarativeBounceEffect>(uri, 1, 0, "BounceEffect");
    qmlRegisterType<DeclarativeGlassItem>(uri, 1, 0, "GlassItem");
    qmlRegisterType<MInverseMouseArea>(uri, 1, 0, "InverseMouseArea");
    qmlRegisterType<DeclarativeCoverAction>(uri, 1, 0, "CoverAction");
    qmlRegisterType<DeclarativeCoverActionList>(uri, 1, 0, "CoverActionList");
    qmlRegisterType<DeclarativeFormatter>(uri, 1, 0, "Formatter");
    qmlRegisterType<DeclarativeDimmedRegion>(uri, 1, 0, "DimmedRegion");
    qmlRegisterType<DeclarativeCover>(uri, 1, 0, "Cover");
    qmlRegisterType<DeclarativeTouchBlocker>(uri, 1, 0, "TouchBlocker");
    qmlRegisterAnonymousType<QAbstractItemModel>(uri, 1);
    qmlRegisterType<FormattingProxyModel>(uri, 1, 0, "FormattingProxyModel");
    qmlRegisterType<ButtonLayout>(uri, 1, 0, "ButtonLayout");
    qmlRegisterType<Pelkan::Palette>(uri, 1, 0, "Palette");
    registerUncreatable<DeclarativeBusyIndicatorSize>(uri, "BusyIndicatorSize");
    registerUncreatable<HorizontalAutoScroll>(uri, "HorizontalAutoScroll");
    registerUncreatable<VerticalAutoScroll>(uri, "VerticalAutoScroll");
}

void registerPrivateModule(const char *uri)
{
    Pelkan::Private::registerPrivateTypes(uri);
    qmlRegisterRevision<QQuickItem, 1>(uri, 1, 0);
    qmlRegisterRevision<QQuickWindow, 1>(uri, 1, 0);
    qmlRegisterType<DeclarativeWindow>(uri, 1, 0, "Window");
    qmlRegisterType<DeclarativeCoverWindow>(uri, 1, 0, "CoverWindow");
    qmlRegisterType<DeclarativeUnderline>(uri, 1, 0, "Underline");
    registerUncreatable<DeclarativeDragFilter>(uri, "DragFilter");
    qmlRegisterType<DeclarativeQuickScrollButtonBase>(uri, 1, 0, "QuickScrollButtonBase");
    qmlRegisterSingletonType<DeclarativeConfigApi>(uri, 1, 0, "Config", [](QQmlEngine *engine, QJSEngine *) -> QObject * {
        return new DeclarativeConfigApi(engine);
    });
    qmlRegisterType<DeclarativePreeditText>(uri, 1, 0, "PreeditText");
    qmlRegisterType<DeclarativeVisibilityCull>(uri, 1, 0, "VisibilityCull");
    qmlRegisterType<PulleyMenuLogic>(uri, 1, 0, "PulleyMenuLogic");
    qmlRegisterType<DeclarativeTextBaseItem>(uri, 1, 0, "TextBaseItem");
    qmlRegisterType<TextLayoutModel>(uri, 1, 0, "TextLayoutModel");
    qmlRegisterType<DragDetectorItem>(uri, 1, 0, "DragDetectorItem");
    registerUncreatable<RemorseCache>(uri, "RemorseCache");
    s_utilType = registerSingleton<DeclarativeUtil>(uri, "Util");
    Pelkan::TouchFeedback::setPlayer(&playTouchFeedback);
    qmlRegisterType<GlassBackground>(uri, 1, 0, "GlassBackgroundBase");
    qmlRegisterType<OverlayGradient>(uri, 1, 0, "OverlayGradientBase");
    qmlRegisterType<BlurEffect>(uri, 1, 0, "BlurEffect");
    qmlRegisterType<AutoScrollController>(uri, 1, 0, "AutoScrollController");
    registerUncreatable<Slide>(uri, "Slide");
    qmlRegisterType<Slideable>(uri, 1, 0, "SlideableBase");
    registerUncreatable<OverlayBackground>(uri, "OverlayBackground");
    qmlRegisterType<OverlayBackgroundSource>(uri, 1, 0, "OverlayBackgroundSource");
    qmlRegisterType<AutoFill>(uri, 1, 0, "AutoFill");
    qmlRegisterType<StringListModel>(uri, 1, 0, "StringListModel");
    qmlRegisterType<DeclarativeVariantInterpolator>(uri, 1, 0, "VariantInterpolator");
    registerUncreatable<TimePickerMode>(uri, "TimePickerMode");
    qmlRegisterType<BubbleBackgroundItem>(uri, 1, 0, "BubbleBackground");
}

void registerThemeModule(const char *uri)
{
    registerSingleton<Pelkan::Theme>(uri, "Theme");
}

} // namespace ModuleRegistration
