import QtQuick 2.15
import "../Theme"
import "Urls.js" as Urls

// The frame of the two crop modes: the map shows only through the mask picture,
// which is white where the map shows; around it lies the frame colour.
Item {
    id: frame

    property string maskSource: ""
    property color color: Theme.filmFrame

    Image {
        id: mask
        anchors.fill: parent
        source: Urls.fromPath(frame.maskSource)
        fillMode: Image.PreserveAspectFit
        visible: false
    }
    ShaderEffectSource {
        id: maskTexture
        sourceItem: mask
        hideSource: true
        visible: false
    }
    ShaderEffect {
        anchors.fill: parent
        property variant mask: maskTexture
        property color frameColor: frame.color
        fragmentShader: "
            varying highp vec2 qt_TexCoord0;
            uniform lowp sampler2D mask;
            uniform lowp vec4 frameColor;
            uniform lowp float qt_Opacity;
            void main() {
                gl_FragColor = frameColor * (1.0 - texture2D(mask, qt_TexCoord0).a) * qt_Opacity;
            }"
    }
}
