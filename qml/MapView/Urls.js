.pragma library

// A picture source as the native side hands it over: a URL (file:, qrc:, image:, ...)
// or a plain file path, which becomes a percent-encoded file URL.
function fromPath(source) {
    if (!source)
        return ""
    var text = String(source)
    if (/^[A-Za-z][A-Za-z0-9+.-]+:/.test(text))
        return text
    var path = text.replace(/\\/g, "/")
    var drive = /^[A-Za-z]:\//.test(path)
    var encoded = path.split("/").map(encodeURIComponent).join("/")
    if (drive)
        return "file:///" + encoded.replace("%3A", ":")
    // A relative path stays relative: the file is looked up from the working folder.
    return (path.charAt(0) === "/" ? "file://" : "file:") + encoded
}

function isAnimated(source) {
    return /\.gif$/i.test(String(source || ""))
}
