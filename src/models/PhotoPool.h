#pragma once

#include "models/PoolPhoto.h"

#include <vector>

class ProjectController;

// The pictures imported into a project, in import order, with the two full-frame
// options that are stored beside them.
class PhotoPool
{
public:
    std::vector<PoolPhoto> photos;
    bool fullFrameBorderEffect = false;
    bool fullFrameCropping = false;

    // The same path is never listed twice: an existing record is returned as it is.
    // A new one gets the next id, the given size and the picture's date and turn.
    PoolPhoto add(const QString &path, int32_t sizeW, int32_t sizeH);
    bool remove(int32_t id);
    PoolPhoto *find(int32_t id);
    int selectedCount() const;
    void clear();

    // Both return whether the value changed.
    bool setFullFrameBorderEffect(bool on);
    bool setFullFrameCropping(bool on);

    // Section "photopool" with "size", one section "photopool_item%d" per picture,
    // then the two options in "fullframe".
    void Save(ProjectController &store) const;
    // A positive size replaces the list; a missing or zero size keeps it. Ids are
    // drawn anew, sizes come from the picture when the file holds none.
    void Load(ProjectController &store);
};

QString photoPoolItemSection(int index);
