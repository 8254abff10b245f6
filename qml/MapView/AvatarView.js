.pragma library

// How an avatar picture is drawn for a direction of travel. Headings are degrees
// clockwise from the top of the screen.

function normalized(degrees) {
    var a = degrees % 360
    return a < 0 ? a + 360 : a
}

// "series" for a 3D avatar, "animated" for an animated picture, "still" for any
// other picture, "" without one.
function kindOf(pilot) {
    if (!pilot || !pilot.sourceFileName)
        return ""
    if (pilot.displayFormat === "perspective")
        return "series"
    return pilot.animated === true ? "animated" : "still"
}

// {rotation, mirrored} for a flat picture. Pictures seen from above show their nose
// up and turn with the road; pictures seen from the side face right and are
// mirrored when heading left, so that they never stand on their heads.
function flatPose(heading, rotates, symmetric) {
    var h = normalized(heading)
    if (!symmetric)
        return { rotation: rotates ? h : 0, mirrored: false }
    var left = h > 180
    if (!rotates)
        return { rotation: 0, mirrored: left }
    return { rotation: left ? h - 270 : h - 90, mirrored: left }
}

// The picture of a series of `frames` views around the avatar: picture k shows it
// heading (k - 1) * 360 / frames degrees.
function frameNumber(heading, frames) {
    var step = 360 / frames
    return 1 + Math.round(normalized(heading) / step) % frames
}
