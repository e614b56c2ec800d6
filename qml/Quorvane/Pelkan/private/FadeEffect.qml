import QtQuick 2.6

// Fades its source out towards one edge (an OpacityRamp direction) over the last
// `rampLength` of it (a fraction); across, the fade starts below `lineTop` (a fraction of
// the height) so only the last line of a text fades.
ShaderEffect {
    property int direction: 0
    property real lineTop: 0
    property real rampLength: 0.25
    readonly property real _direction: direction

    fragmentShader: "
        varying highp vec2 qt_TexCoord0;
        uniform sampler2D source;
        uniform lowp float qt_Opacity;
        uniform highp float _direction;
        uniform highp float lineTop;
        uniform highp float rampLength;
        void main() {
            highp vec2 p = qt_TexCoord0;
            highp float t = _direction < 0.5 ? p.x : _direction < 1.5 ? 1.0 - p.x
                          : _direction < 2.5 ? p.y : 1.0 - p.y;
            highp float alpha = clamp((1.0 - t) / max(rampLength, 0.0001), 0.0, 1.0);
            if (_direction < 1.5 && p.y < lineTop)
                alpha = 1.0;
            gl_FragColor = texture2D(source, p) * alpha * qt_Opacity;
        }"
}
