.pragma library

// Looks through items, popups and their content for objects by name.
function findAll(object, name, found) {
    found = found || []
    if (!object)
        return found
    if (object.objectName === name)
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
