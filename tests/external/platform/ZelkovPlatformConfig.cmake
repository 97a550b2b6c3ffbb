include(CMakeFindDependencyMacro)
find_dependency(Qt5 5.12 COMPONENTS Core Gui Widgets)
include("${CMAKE_CURRENT_LIST_DIR}/ZelkovPlatformTargets.cmake")
