// A rounded rectangle, joined by a triangular tail where TAILED is defined, filled over an optional
// backdrop, brightened by a screen-anchored pattern and edged by a border; the edges are
// antialiased from the distance to the outline.
uniform lowp vec4 color;        // premultiplied
uniform lowp vec4 borderColor;  // premultiplied
uniform lowp float qt_Opacity;
uniform lowp sampler2D backdropTexture;
uniform highp vec4 backdropRect; // the backdrop's part of its texture: x, y, width, height
uniform lowp float backdropWeight; // 0 without a backdrop, else 1
uniform lowp sampler2D patternTexture;
uniform lowp float patternWeight;  // 0 without a pattern
varying highp vec2 v_local;
varying highp vec4 v_shape;
varying highp vec4 v_tailBase;
varying highp vec4 v_tailTipTx;
varying highp vec2 v_patternTx;

highp float edgeDistance(highp vec2 p, highp vec2 a, highp vec2 e)
{
    highp vec2 v = p - a;
    highp vec2 q = v - e * clamp(dot(v, e) / max(dot(e, e), 1e-4), 0.0, 1.0);
    return dot(q, q);
}

// Signed distance to the triangle (a, b, c), negative inside.
highp float triangleDistance(highp vec2 p, highp vec2 a, highp vec2 b, highp vec2 c)
{
    highp vec2 e0 = b - a, e1 = c - b, e2 = a - c;
    highp float d = min(min(edgeDistance(p, a, e0), edgeDistance(p, b, e1)), edgeDistance(p, c, e2));
    highp float s = sign(e0.x * e2.y - e0.y * e2.x);
    highp float inside = min(min(s * ((p - a).x * e0.y - (p - a).y * e0.x), s * ((p - b).x * e1.y - (p - b).y * e1.x)),
                             s * ((p - c).x * e2.y - (p - c).y * e2.x));
    return inside > 0.0 ? -sqrt(d) : sqrt(d);
}

void main()
{
    lowp float coverage = 1.0;
    lowp float inner = 1.0;
    highp vec2 halfSize = v_shape.xy;
    // Clear of the corners, the border and the edge, a pixel is simply inside: most are.
    highp vec2 q = abs(v_local) - halfSize + max(v_shape.z, v_shape.w) + 1.0;
#ifndef TAILED
    if (max(q.x, q.y) > 0.0)
#endif
    {
        highp float radius = min(v_shape.z, min(halfSize.x, halfSize.y));
        q = abs(v_local) - halfSize + radius;
        highp float d = length(max(q, 0.0)) + min(max(q.x, q.y), 0.0) - radius;
#ifdef TAILED
        d = min(d, triangleDistance(v_local, v_tailBase.xy, v_tailBase.zw, v_tailTipTx.xy));
#endif
        coverage = clamp(0.5 - d, 0.0, 1.0);
        inner = clamp(0.5 - d - v_shape.w, 0.0, 1.0);
    }
    highp vec2 tx = backdropRect.xy + clamp(v_tailTipTx.zw, 0.0, 1.0) * backdropRect.zw;
    lowp vec4 fill = color;
    if (backdropWeight > 0.0)
        fill += (1.0 - color.a) * texture2D(backdropTexture, tx);
    if (patternWeight > 0.0)
        fill = mix(fill, vec4(fill.a), patternWeight * texture2D(patternTexture, v_patternTx).a);
    gl_FragColor = qt_Opacity * (fill * inner + borderColor * (coverage - inner));
}
