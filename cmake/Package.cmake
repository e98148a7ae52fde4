# The two Debian packages that CPack makes of the components: libzarnmath<interface version> holds what a program needs to
# run, libzarnmath-dev what its compilation needs. Configure with the prefix /usr for them, as the preset `deb` does.
#
# CPack brings the list of files, the checksums and the dependencies. What else a package has to have stands here.
set(runtime_package libzarnmath${zarnmath_interface_version})
set(dev_package libzarnmath-dev)
set(ZARNMATH_MAINTAINER "ZarnMath maintainers <maintainers@zarnmath.example>" CACHE STRING
    "Whom the Debian packages name as their maintainer")

# Documents: the copyright, and the lists of changes, which policy wants compressed. They are no part of a plain
# `cmake --install`.
find_program(GZIP_PROGRAM gzip)
string(TIMESTAMP package_date "%a, %d %b %Y %H:%M:%S +0000" UTC)
set(documents ${PROJECT_BINARY_DIR}/package)
configure_file(${PROJECT_SOURCE_DIR}/cmake/package/changelog.in ${documents}/changelog.Debian @ONLY)
configure_file(${PROJECT_SOURCE_DIR}/CHANGELOG.md ${documents}/changelog COPYONLY)
if(GZIP_PROGRAM)
    execute_process(COMMAND ${GZIP_PROGRAM} -9nf changelog changelog.Debian
        WORKING_DIRECTORY ${documents} COMMAND_ERROR_IS_FATAL ANY)
endif()
foreach(component IN ITEMS runtime dev)
    set(package ${${component}_package})
    install(FILES ${PROJECT_SOURCE_DIR}/cmake/package/copyright ${documents}/changelog.gz ${documents}/changelog.Debian.gz
        DESTINATION ${CMAKE_INSTALL_DATAROOTDIR}/doc/${package} COMPONENT ${component} EXCLUDE_FROM_ALL)
    set(overrides ${documents}/${component}-overrides)
    configure_file(${PROJECT_SOURCE_DIR}/cmake/package/${component}-overrides.in ${overrides} @ONLY)
    install(FILES ${overrides} DESTINATION ${CMAKE_INSTALL_DATAROOTDIR}/lintian/overrides RENAME ${package}
        COMPONENT ${component} EXCLUDE_FROM_ALL)
endforeach()

set(CPACK_GENERATOR DEB)
set(CPACK_COMPONENTS_ALL runtime dev)
set(CPACK_PACKAGE_VENDOR ZarnMath)
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "") # each package has a first line of its own
set(CPACK_PACKAGE_CONTACT "${ZARNMATH_MAINTAINER}")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_RELEASE 1)
set(CPACK_DEBIAN_PACKAGE_SOURCE zarnmath)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")

set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME ${runtime_package})
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_RUNTIME_PACKAGE_CONTROL_EXTRA ${PROJECT_SOURCE_DIR}/cmake/package/triggers)
set(CPACK_DEBIAN_RUNTIME_DESCRIPTION "geometry and numerics of a vector-graphics application
Analysis of cubic Bezier segments on a polynomial root finder of its own,
matrices and bounds, fits, a vector field, a tridiagonal solver, and a
little of space. The same input gives the same bits on every machine.

This package holds the shared library.")

set(CPACK_DEBIAN_DEV_PACKAGE_NAME ${dev_package})
set(CPACK_DEBIAN_DEV_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEV_PACKAGE_DEPENDS "${runtime_package} (= ${PROJECT_VERSION}-${CPACK_DEBIAN_PACKAGE_RELEASE})")
set(CPACK_DEBIAN_DEV_DESCRIPTION "geometry and numerics of a vector-graphics application (development files)
Analysis of cubic Bezier segments on a polynomial root finder of its own,
matrices and bounds, fits, a vector field, a tridiagonal solver, and a
little of space. The same input gives the same bits on every machine.

This package holds the headers, the static library, and what CMake and
pkg-config read.")

include(CPack)
