# What the tests named in `tests` run under: no setting that the CDF library takes from the
# environment, and what the sanitizers need to know about that library.
if(tests)
  set(seconds 120)
  if(AMBRIX_SANITIZE)
    set(seconds 600)
  endif()
  set(supp "${CMAKE_CURRENT_LIST_DIR}/sanitizers")
  set(environment
    "ASAN_OPTIONS=suppressions=${supp}/asan.supp:detect_stack_use_after_return=1${asan_options}"
    "UBSAN_OPTIONS=print_stacktrace=1"
    "PYTHONDONTWRITEBYTECODE=1")
  set(unset CDF_VALIDATE=unset: CDF_CHECKSUM=unset: CDF_FILEBACKWARD=unset: CDF_TMP=unset:
    CDF_LEAPSECONDSTABLE=unset:)
  set_tests_properties(${tests} PROPERTIES
    ENVIRONMENT "${environment}"
    ENVIRONMENT_MODIFICATION "${unset}"
    TIMEOUT ${seconds})
endif()
