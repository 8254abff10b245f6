#pragma once

#include <QString>

#include <cstdint>
#include <optional>

// The route style the user picks, and what it means for the generator and drawing.
namespace PathMode {

constexpr int32_t Line = 0;
constexpr int32_t Curve = 1;
constexpr int32_t Airplane = 2;
constexpr int32_t Route = 3;

struct Mapping
{
    int32_t curveMode; // generator of the path
    int32_t drawMode;  // "drawmode" of the project: 0 for routes
};

// Empty for a mode above "route" (or below "line"): such a value changes nothing.
std::optional<Mapping> map(int32_t pathMode);
// "line", "curve", "airplane", "route"; -1 for anything else.
int32_t fromName(const QString &name);

}
