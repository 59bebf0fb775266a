# qrx_find_python(RESULT): an interpreter that has what the package for Python is built with; empty where none has.
function(qrx_find_python result)
    set(${result} "" PARENT_SCOPE)
    find_program(QRX_FIRST_PYTHON NAMES python3 python)
    foreach(candidate ${Python_EXECUTABLE} ${QRX_FIRST_PYTHON} /usr/bin/python3)
        execute_process(COMMAND ${candidate} -c
            "import sys, sysconfig, os; assert sys.version_info >= (3, 11); \
assert os.path.exists(os.path.join(sysconfig.get_path('include'), 'Python.h')); import numpy, pytest, pybind11"
            RESULT_VARIABLE failed OUTPUT_QUIET ERROR_QUIET)
        if(NOT failed)
            set(${result} ${candidate} PARENT_SCOPE)
            return()
        endif()
    endforeach()
endfunction()
