attribute highp vec4 vertex;
attribute highp vec2 local;     // from the body's centre, in item pixels
attribute highp vec4 shape;     // body half width, half height, corner radius, border width
attribute highp vec4 tailBase;  // the tail's two base corners, from the body's centre
attribute highp vec4 tailTipTx; // the tail's tip; the backdrop's coordinates (0..1 across it)
uniform highp mat4 qt_Matrix;
uniform highp mat4 patternMatrix;
varying highp vec2 v_local;
varying highp vec4 v_shape;
varying highp vec4 v_tailBase;
varying highp vec4 v_tailTipTx;
varying highp vec2 v_patternTx;

void main()
{
    v_local = local;
    v_shape = shape;
    v_tailBase = tailBase;
    v_tailTipTx = tailTipTx;
    gl_Position = qt_Matrix * vertex;
    v_patternTx = (patternMatrix * gl_Position).xy;
}
