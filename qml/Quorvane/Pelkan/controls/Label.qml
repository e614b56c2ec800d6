import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

/*!
    \qmltype Label
    \inqmlmodule Quorvane.Pelkan
    \brief Text in the theme's colour and size, elided or faded where it does not fit.
*/
Text {
    id: label

    /*! TruncationMode.None, Elide (text that does not fit ends in an ellipsis) or Fade (the
        last line that fits fades out towards its end, only when the text does not fit). */
    property int truncationMode: TruncationMode.None
    /*! Which way a fading label fades (an OpacityRamp direction); follows the text's
        direction until set. */
    property int fadeDirection: effectiveHorizontalAlignment === Text.AlignRight ? OpacityRamp.RightToLeft
                                                                                : OpacityRamp.LeftToRight

    color: Theme.primaryColor
    font.pixelSize: Theme.fontSizeMedium
    elide: truncationMode === TruncationMode.Elide ? Text.ElideRight : Text.ElideNone

    QtObject {
        id: internal
        // Only a fading label reads its size back: the others cost nothing for it.
        readonly property bool fading: label.truncationMode === TruncationMode.Fade
                                       && (label.wrapMode === Text.NoWrap ? label.contentWidth > label.width + 0.5
                                                                          : label.truncated || label.contentHeight > label.height + 0.5)
        // The lines as laid out, for the fade to find the last one; made only for multi-line
        // fading labels.
        property Private.TextLayoutModel lines: null

        // The layer and its effect are made the first time the label fades.
        onFadingChanged: {
            if (fading && label.wrapMode !== Text.NoWrap && !lines)
                lines = linesComponent.createObject(label)
            if (fading && !label.layer.effect)
                label.layer.effect = fadeComponent
            label.layer.enabled = fading
            label.clip = fading
        }
    }

    Component {
        id: linesComponent
        Private.TextLayoutModel {
            text: label.text
            font: label.font
            width: label.width
            maximumLineCount: label.maximumLineCount < 1e6 ? label.maximumLineCount : 0
        }
    }

    Component {
        id: fadeComponent
        Private.FadeEffect {
            direction: label.fadeDirection
            // Only the last line that shows fades: everything above it stays whole.
            lineTop: {
                if (label.wrapMode === Text.NoWrap || !internal.lines || internal.lines.count < 2)
                    return 0
                var shown = Math.max(1, Math.min(label.lineCount, internal.lines.count))
                return Math.min(1, internal.lines.lineRect(shown - 1).y / Math.max(1, label.height))
            }
            rampLength: Math.min(1, Theme.paddingLarge * 4 / Math.max(1, direction < OpacityRamp.TopToBottom ? label.width : label.height))
        }
    }
}
