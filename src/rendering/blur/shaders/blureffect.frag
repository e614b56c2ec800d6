// The blurred copy mixed with the sharp source, then tinted by the overlay colour.
uniform lowp sampler2D sourceTexture;
uniform lowp sampler2D blurTexture;
uniform mediump vec4 overlayColor;
uniform mediump float blurAlpha;
uniform lowp float opacity;

varying highp vec2 sourceTx;
varying highp vec2 blurTx;

void main()
{
    lowp vec4 c = mix(texture2D(sourceTexture, sourceTx), texture2D(blurTexture, blurTx), blurAlpha);
    gl_FragColor = vec4(mix(c.rgb, overlayColor.rgb, overlayColor.a), c.a) * opacity;
}
