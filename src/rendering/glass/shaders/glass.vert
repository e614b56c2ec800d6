attribute highp vec4 vertex;
attribute highp vec2 a_texCoord;
uniform highp mat4 qt_Matrix;
uniform highp mat4 patternMatrix;
varying highp vec2 v_texCoord;
varying highp vec2 v_patternCoord;

void main()
{
    v_texCoord = a_texCoord;
    gl_Position = qt_Matrix * vertex;
    v_patternCoord = (patternMatrix * gl_Position).xy;
}
