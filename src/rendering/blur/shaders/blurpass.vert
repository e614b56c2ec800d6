// One pass of the separable blur, sampling along the input texture's x axis, with p
// merged tap pairs per side: each pair is one linear-filtered fetch at the weighted mean
// offset of its two taps. The weight varyings and their assignments are written out per
// kernel where the capitalised markers stand.
attribute highp vec4 vertexPosition;
attribute highp vec4 vertexTx;
attribute highp vec4 vertexDirection;
attribute highp vec4 vertexLimits;

uniform highp mat4 sourceTransform;
uniform highp vec3 deltas;
uniform highp float inputWeights[WEIGHT_COUNT];

varying highp vec2 tx;
varying highp vec2 limits;
WEIGHT_VARYINGS

void main()
{
    highp float delta = dot(deltas, vertexDirection.xyz);
    gl_Position = vertexPosition;
    tx = (sourceTransform * vertexTx).xy;
    highp float a = (sourceTransform * vec4(vertexLimits.x, 0.0, 0.0, 1.0)).x;
    highp float b = (sourceTransform * vec4(vertexLimits.y, 0.0, 0.0, 1.0)).x;
    limits = vec2(min(a, b), max(a, b)) + vec2(0.5, -0.5) * delta;
    weight0 = vec2(inputWeights[0], 0.0);
WEIGHT_ASSIGNMENTS
}
