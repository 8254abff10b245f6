#pragma once

#include <string>

// Copies a finished MP4 or ASF film, streams untouched, with `comment` in the
// container's comment tag, and puts the copy in place of the original.
bool rewriteWithComment(const std::string &fileName, const std::string &comment);
