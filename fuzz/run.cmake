# Runs a fuzz target as a test: the same inputs each time, and the seeds' folders are only read.
file(REMOVE_RECURSE ${SCRATCH})
file(MAKE_DIRECTORY ${SCRATCH})
execute_process(
    COMMAND ${TARGET} -runs=20000 -seed=1 -max_len=4096 -timeout=20 -dict=${DICTIONARY}
            -artifact_prefix=${SCRATCH}.found- -print_final_stats=1 ${SCRATCH} ${SEEDS}
    RESULT_VARIABLE result)
if(NOT result EQUAL 0)
    message(FATAL_ERROR "${TARGET} found an input that fails: ${result}")
endif()
