#pragma once

#include <QString>

class AppSettings;
class QScreen;
struct StartSwitches;

// Choices made at start from the settings and the screen.
namespace Startup {

inline constexpr const char *RenderLoopVariable = "QSG_RENDER_LOOP";
inline constexpr const char *BugListVariable = "QT_OPENGL_BUGLIST";
// Relative: it resolves in the program folder, which is the working folder by the
// time Qt reads it.
inline constexpr const char *BugListFile = "zkopenglblacklist.json";
// Screens taller than this (available height) get the double-size interface.
inline constexpr int HighDensityHeight = 1450;

// For "basic", "threaded" or "windows" (exact match) sets the bug list and the render
// loop in the environment, for Qt to read when it starts; any other value sets
// nothing. True when the environment was set.
bool applyRenderLoopChoice(const QString &value);

// The stored render loop goes to the environment unless "/noblacklist" was given.
// Must run before the application object exists.
void chooseRenderLoop(const StartSwitches &switches, const AppSettings &settings);

// 2.0 above the high-density height, otherwise 1.0.
double scaleForAvailableHeight(int availableHeight);
// The scale for the primary screen; 1.0 without one.
double screenScale(const QScreen *primaryScreen);

} // namespace Startup
