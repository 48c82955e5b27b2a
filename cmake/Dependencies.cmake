# Every dependency comes from the distribution's packages (scripts/install-deps).
find_package(PkgConfig REQUIRED)
find_package(Threads REQUIRED)

pkg_check_modules(EFL REQUIRED IMPORTED_TARGET
  elementary ecore ecore-evas ecore-file evas edje eina eo efl)
pkg_check_modules(GLIB REQUIRED IMPORTED_TARGET glib-2.0)
pkg_check_modules(SQLITE REQUIRED IMPORTED_TARGET sqlite3)
pkg_check_modules(ICU REQUIRED IMPORTED_TARGET icu-uc icu-i18n)

find_library(PHONENUMBER_LIB phonenumber REQUIRED)
find_path(PHONENUMBER_INCLUDE phonenumbers/phonenumberutil.h REQUIRED)
add_library(ct::phonenumber INTERFACE IMPORTED)
set_target_properties(ct::phonenumber PROPERTIES
  INTERFACE_LINK_LIBRARIES ${PHONENUMBER_LIB}
  INTERFACE_INCLUDE_DIRECTORIES ${PHONENUMBER_INCLUDE})

# Tests of the set-up make configure fail once by naming a package that
# does not exist.
if(DEFINED ENV{CT_TEST_MISSING_PACKAGE})
  pkg_check_modules(CT_TEST_MISSING REQUIRED $ENV{CT_TEST_MISSING_PACKAGE})
endif()

find_package(GTest REQUIRED)
if(CT_BUILD_BENCH)
  find_package(benchmark REQUIRED)
endif()

find_program(EDJE_CC edje_cc REQUIRED)
find_program(MSGFMT msgfmt REQUIRED)

# Debian's EFL .pc files name include folders that the packages do not ship
# (ector-1); drop those. EFL headers are not ours to keep warning-free.
foreach(dep EFL GLIB ICU)
  get_target_property(dirs PkgConfig::${dep} INTERFACE_INCLUDE_DIRECTORIES)
  set(existing)
  foreach(d ${dirs})
    if(EXISTS ${d})
      list(APPEND existing ${d})
    endif()
  endforeach()
  set_target_properties(PkgConfig::${dep} PROPERTIES
    INTERFACE_INCLUDE_DIRECTORIES "${existing}"
    INTERFACE_SYSTEM_INCLUDE_DIRECTORIES "${existing}")
endforeach()
