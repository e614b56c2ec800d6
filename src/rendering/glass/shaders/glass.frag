// DASH_COORDINATE is replaced per screen rotation by the coordinate the dashes run along.
uniform lowp vec4 color;
uniform lowp vec4 backgroundColor;
uniform lowp vec2 centersize;
uniform lowp float border;
uniform mediump float sigma;
uniform lowp float qt_Opacity;
uniform lowp float brightness;
uniform lowp float size;
uniform mediump vec3 dash;
uniform lowp sampler2D patternTexture;
uniform lowp float patternWeight; // 0 while there is no pattern texture
varying highp vec2 v_texCoord;
varying highp vec2 v_patternCoord;

void main()
{
    lowp float halfSize = size * 0.5;
    lowp float dashOpacity = 1.0;
    lowp float pattern = patternWeight * texture2D(patternTexture, v_patternCoord).a;
    if (dash.x > halfSize) {
        mediump float p = mod(DASH_COORDINATE, dash.y);
        dashOpacity = smoothstep(0.0, halfSize, p) * (1.0 - smoothstep(dash.x - halfSize, dash.x, p));
    }
    lowp vec2 n = 1.0 - 2.0 * centersize;
    mediump vec2 d = max(vec2(0.0), abs(v_texCoord - 0.5) - centersize) / n;
    lowp float disc = 1.0 - smoothstep(0.0, 1.0, length(d) / border);
    lowp float shi = dashOpacity * min(1.0, exp2(-dot(d, d) / (sigma * sigma)));
    gl_FragColor = qt_Opacity * mix(backgroundColor * (shi * (1.0 - disc)), color,
                                    dashOpacity * min(1.0, brightness * shi * (1.0 + shi + 2.0 * disc) * 0.25 + shi * pattern));
}
