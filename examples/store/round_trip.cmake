# Tests zel-store end to end on tree files (memory:FILE.json stores).
#   STORE_TOOL  the zel-store program
#   WORK_DIR    a folder it may empty and use
file(REMOVE_RECURSE "${WORK_DIR}")
file(MAKE_DIRECTORY "${WORK_DIR}")
set(problems "")

# Runs zel-store with the arguments after the expected status and output
# patterns; records a problem when the status or an output does not match.
function(run status stdout_regex stderr_regex)
  execute_process(COMMAND "${STORE_TOOL}" ${ARGN}
    RESULT_VARIABLE got OUTPUT_VARIABLE out ERROR_VARIABLE err)
  set(last_stdout "${out}" PARENT_SCOPE)
  if(NOT "${got}" STREQUAL "${status}" OR NOT "${out}" MATCHES "${stdout_regex}" OR NOT "${err}" MATCHES "${stderr_regex}")
    set(problems "${problems}zel-store ${ARGN}: status ${got} (expected ${status})\n--- stdout:\n${out}--- stderr:\n${err}\n" PARENT_SCOPE)
  endif()
endfunction()

function(expect_same_file a b)
  file(READ "${a}" content_a HEX)
  file(READ "${b}" content_b HEX)
  if(NOT content_a STREQUAL content_b OR content_a STREQUAL "")
    set(problems "${problems}${b} differs from ${a}\n" PARENT_SCOPE)
  endif()
endfunction()

set(a "${WORK_DIR}/a.json")
set(b "${WORK_DIR}/b.json")
set(c "${WORK_DIR}/c.json")

run(0 "^zel-store: exported memory: to [^\n]*a\\.json\n$" "^$" export memory: "${a}")
run(0 "^zel-store: imported [^\n]*a\\.json into memory:[^\n]*b\\.json: ([0-9]+) nodes, 4 users, [0-9]+ keys, [0-9]+ settings\n$" "^$"
  import "${a}" "memory:${b}")
string(REGEX MATCH ": ([0-9]+) nodes" imported "${last_stdout}")
set(nodes "${CMAKE_MATCH_1}")
expect_same_file("${a}" "${b}")
run(0 "^zel-store: exported memory:[^\n]*b\\.json to [^\n]*c\\.json\n$" "^$" export "memory:${b}" "${c}")
expect_same_file("${a}" "${c}")

# A store that holds a tree is refused and left alone; --replace replaces it.
run(1 "^$" "^zel-store: memory:[^\n]*b\\.json holds a tree already \\(${nodes} nodes\\); --replace replaces it\n$"
  import "${a}" "memory:${b}")
expect_same_file("${a}" "${b}")
run(0 "imported" "^$" import --replace "${a}" "memory:${b}")
expect_same_file("${a}" "${b}")

run(0 "^store:    memory:[^\n]*b\\.json\nkind:     memory\nserver:   [^\n]+\nschema:   none [^\n]*\nnodes:    ${nodes}\nusers:    4\nkeys:     [0-9]+\nsettings: [0-9]+\n$"
  "^$" info "memory:${b}")

# Refusals: the reason on stderr, nothing written.
run(1 "^$" "^zel-store: bad store URL \"nosuch:x\": unknown store type \"nosuch\"" info nosuch:x)
run(1 "^$" "^zel-store: [^\n]*missing\\.json: cannot be read" import "${WORK_DIR}/missing.json" "memory:${WORK_DIR}/d.json")
run(1 "^$" "^zel-store: [^\n]*nothing\\.json: cannot be read" export "memory:${WORK_DIR}/nothing.json" "${WORK_DIR}/e.json")
if(EXISTS "${WORK_DIR}/d.json" OR EXISTS "${WORK_DIR}/e.json")
  set(problems "${problems}a refused command wrote a file\n")
endif()
run(2 "^$" "^zel-store: unknown command 'frobnicate'" frobnicate)
run(2 "^$" "^zel-store: import needs a tree file and a store URL" import "${a}")

if(problems)
  message(FATAL_ERROR "${problems}")
endif()
