# What `cmake --install` lays down: the headers, both libraries, and what find_package and pkg-config read. Two components,
# so that a machine that only runs programs gets no more than the shared library: `runtime` and `dev`.
include(CMakePackageConfigHelpers)

# The exported headers. The others state what is inside, and stay there.
set(public_headers
    Bezier.h
    BezierOffset.h
    BezierToLines.h
    Bounds.h
    Circle.h
    Export.h
    FitBezier.h
    FitLine.h
    Layout.h
    Line.h
    Numeric.h
    PlainC.h
    Quaternion.h
    Random.h
    TridiagonalMatrix.h
    ValueTypes.h
    VectorField.h
    WMath.h
    WMath3D.h
    ZarnMath.h)
list(TRANSFORM public_headers PREPEND ${PROJECT_SOURCE_DIR}/Engines/ZarnMath/)
install(FILES ${public_headers} DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/ZarnMath COMPONENT dev)
install(FILES ${PROJECT_SOURCE_DIR}/Engines/ZarnUtils/interval_vector.h
    DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/ZarnUtils COMPONENT dev)
install(FILES ${PROJECT_SOURCE_DIR}/Framework/common_types/common_types.h
    DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/Framework/common_types COMPONENT dev)

install(TARGETS ZarnMath EXPORT ZarnMathSharedTargets
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT runtime NAMELINK_COMPONENT dev)
install(TARGETS ZarnMathStatic EXPORT ZarnMathStaticTargets
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT dev)

# Each library is a component of find_package, with a file of targets of its own.
set(config_folder ${CMAKE_INSTALL_LIBDIR}/cmake/ZarnMath)
foreach(component IN ITEMS Shared Static)
    install(EXPORT ZarnMath${component}Targets NAMESPACE ZarnMath:: DESTINATION ${config_folder} COMPONENT dev)
endforeach()
configure_package_config_file(${PROJECT_SOURCE_DIR}/cmake/ZarnMathConfig.cmake.in
    ${PROJECT_BINARY_DIR}/ZarnMathConfig.cmake INSTALL_DESTINATION ${config_folder})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/ZarnMathConfigVersion.cmake
    COMPATIBILITY ${zarnmath_compatibility})
install(FILES ${PROJECT_BINARY_DIR}/ZarnMathConfig.cmake ${PROJECT_BINARY_DIR}/ZarnMathConfigVersion.cmake
    DESTINATION ${config_folder} COMPONENT dev)

# The files of pkg-config find the rest from where they stand themselves, so that an installed copy can be moved.
set(pkgconfig_folder ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
set(prefix_from_pkgconfig ${CMAKE_INSTALL_PREFIX})
cmake_path(RELATIVE_PATH prefix_from_pkgconfig BASE_DIRECTORY ${CMAKE_INSTALL_PREFIX}/${pkgconfig_folder})
get_target_property(usage_options ZarnMath INTERFACE_COMPILE_OPTIONS)
list(JOIN usage_options " " usage_options)
# What a linker that is not told of C++ has to add for the archive.
set(cxx_libraries ${CMAKE_CXX_IMPLICIT_LINK_LIBRARIES})
list(FILTER cxx_libraries INCLUDE REGEX "^(stdc\\+\\+|c\\+\\+|m)$")
list(TRANSFORM cxx_libraries PREPEND -l)
list(JOIN cxx_libraries " " cxx_libraries)
foreach(module IN ITEMS zarnmath zarnmath-static)
    configure_file(${PROJECT_SOURCE_DIR}/cmake/${module}.pc.in ${PROJECT_BINARY_DIR}/${module}.pc @ONLY)
    install(FILES ${PROJECT_BINARY_DIR}/${module}.pc DESTINATION ${pkgconfig_folder} COMPONENT dev)
endforeach()
