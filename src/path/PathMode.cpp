#include "path/PathMode.h"

#include "path/Path.h"

namespace PathMode {

std::optional<Mapping> map(int32_t pathMode)
{
    switch (pathMode) {
    case Line: return Mapping{CurveMode::Straight, 1};
    case Curve: return Mapping{CurveMode::Smooth, 1};
    case Airplane: return Mapping{CurveMode::Arc, 1};
    case Route: return Mapping{CurveMode::Straight, 0};
    default: return std::nullopt;
    }
}

int32_t fromName(const QString &name)
{
    static const char *const names[] = {"line", "curve", "airplane", "route"};
    for (int32_t i = 0; i < 4; ++i) {
        if (name == QLatin1String(names[i]))
            return i;
    }
    return -1;
}

}
