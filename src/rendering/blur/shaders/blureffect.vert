attribute highp vec4 vertexPosition;
attribute highp vec4 vertexTx;

uniform highp mat4 positionTransform;
uniform highp mat4 sourceTransform;
uniform highp mat4 blurTransform;

varying highp vec2 sourceTx;
varying highp vec2 blurTx;

void main()
{
    sourceTx = (sourceTransform * vertexTx).xy;
    blurTx = (blurTransform * vertexTx).xy;
    gl_Position = positionTransform * vertexPosition;
}
