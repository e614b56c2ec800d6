// Fetches are clamped to the limits: the blur never reads outside the input rectangle.
uniform lowp sampler2D source;

varying highp vec2 tx;
varying highp vec2 limits;
WEIGHT_VARYINGS

void main()
{
    gl_FragColor = texture2D(source, tx) * weight0.x
PAIR_FETCHES;
}
