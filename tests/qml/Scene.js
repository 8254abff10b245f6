.pragma library

// Looks through items, popups and their content for objects by name.
function findAll(object, name, found) {
    found = found || []
    if (!object)
        return found
    // A name ending in "_" stands for all names that begin with it.
    var matches = name.charAt(name.length - 1) === "_" ? String(object.objectName).indexOf(name) === 0
                                                        : object.objectName === name
    if (matches)
        found.push(object)
    var next = []
    var list = object.data !== undefined ? object.data : object.children
    for (var i = 0; list && i < list.length; ++i)
        next.push(list[i])
    if (object.contentItem && next.indexOf(object.contentItem) < 0)
        next.push(object.contentItem)
    if (object.sourceItem && next.indexOf(object.sourceItem) < 0)
        next.push(object.sourceItem)
    for (var j = 0; j < next.length; ++j)
        findAll(next[j], name, found)
    return found
}

function find(object, name) {
    var found = findAll(object, name)
    return found.length > 0 ? found[0] : null
}
