import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Text in the theme's colour and size. With `truncationMode` TruncationMode.Elide text that
// does not fit ends in an ellipsis; with TruncationMode.Fade the last line that fits fades
// out instead, towards its end (`fadeDirection`, an OpacityRamp direction, follows the
// text's direction unless set), and only when the text does not fit.
Text {
    id: label

    property int truncationMode: TruncationMode.None
    property int fadeDirection: effectiveHorizontalAlignment === Text.AlignRight ? OpacityRamp.RightToLeft
                                                                                : OpacityRamp.LeftToRight
    // Only a fading label reads its size back: the others cost nothing for it.
    readonly property bool _fading: truncationMode === TruncationMode.Fade
                                    && (wrapMode === Text.NoWrap ? contentWidth > width + 0.5
                                                                 : truncated || contentHeight > height + 0.5)
    // The lines as laid out, for the fade to find the last one; made only for multi-line
    // fading labels.
    property Private.TextLayoutModel _lines: null

    color: Theme.primaryColor
    font.pixelSize: Theme.fontSizeMedium
    elide: truncationMode === TruncationMode.Elide ? Text.ElideRight : Text.ElideNone

    // The layer and its effect are made the first time the label fades.
    on_FadingChanged: {
        if (_fading && wrapMode !== Text.NoWrap && !_lines)
            _lines = linesComponent.createObject(label)
        if (_fading && !layer.effect)
            layer.effect = fadeComponent
        layer.enabled = _fading
        clip = _fading
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
                if (label.wrapMode === Text.NoWrap || !label._lines || label._lines.count < 2)
                    return 0
                var shown = Math.max(1, Math.min(label.lineCount, label._lines.count))
                return Math.min(1, label._lines.lineRect(shown - 1).y / Math.max(1, label.height))
            }
            rampLength: Math.min(1, Theme.paddingLarge * 4 / Math.max(1, direction < OpacityRamp.TopToBottom ? label.width : label.height))
        }
    }
}
