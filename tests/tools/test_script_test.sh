#!/bin/bash
# What scripts/test runs in both of its forms, and what it makes of how that ends: the script in a folder of its own,
# with stand-ins for all that it calls, so that nothing is built or tested for real.
# shellcheck disable=SC2016 # the stand-ins expand it
set -u
here=$(cd -- "$(dirname -- "$0")" && pwd -P)
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
failures=0

mkdir -p "$folder/project/scripts" "$folder/bin"
cp "$here/../../scripts/test" "$here/../../scripts/setup.sh" "$folder/project/scripts/"

# stand_in FILE [LINE]: a program that writes down how it is called, and then does what the line says.
stand_in() {
  printf '#!/bin/bash\necho "%s${*:+ $*}" >>%q\n%s\n' "$(basename -- "$1")" "$folder/log" "${2-}" >"$folder/$1"
  chmod +x "$folder/$1"
}

# Each program passes: every package is installed, and every build and test is as it should be.
all_well() {
  local program
  printf '#!/bin/bash\necho installed\n' >"$folder/bin/dpkg-query"
  chmod +x "$folder/bin/dpkg-query"
  for program in cmake ninja clang-format; do stand_in "bin/$program"; done
  for program in fuzz analyse determinism coverage mutate; do stand_in "project/scripts/$program"; done
  stand_in bin/ctest "echo '100% tests passed, 0 tests failed out of 7'
    mkdir -p build/\$2/Testing/Temporary
    printf 'LEFT OUT: %s\nLEFT OUT: %s\n' 'two things' 'two things' >build/\$2/Testing/Temporary/LastTest.log
    echo \"\$2 \${MAYASCENE_TESTS-quick}\" >>$folder/forms"
}

# The long form runs this test too: which form a run has is decided by its own options alone.
unset MAYASCENE_TESTS

# run STATUS OPTION...: runs the script, which has to end so. The log then holds what it called.
run() {
  local status=$1
  shift
  : >"$folder/log"
  : >"$folder/forms"
  # A name without a suffix needs a source to be formatted.
  : >"$folder/project/a.cpp"
  PATH=$folder/bin:/usr/bin:/bin "$folder/project/scripts/test" "$@" >"$folder/out" 2>"$folder/err" </dev/null
  local actual=$?
  [ "$actual" -eq "$status" ] || complain "it ends with $actual, not with $status: $(cat "$folder/err")"
}

complain() {
  printf 'FAILED: %s: %s\n' "$name" "$1"
  failures=$((failures + 1))
}

# expect FILE LINE: the line stands there; expect_none: it does not.
expect() { grep -qxF -- "$2" "$folder/$1" || complain "\"$2\" is missing in: $(cat "$folder/$1")"; }
expect_none() { ! grep -q -- "$2" "$folder/$1" || complain "\"$2\" stands in: $(cat "$folder/$1")"; }

quick_call() { printf 'ctest --preset test -j %s --no-tests=error -LE ^wide$%s' "$(nproc)" "${1-}"; }
wide_call() { printf 'ctest --preset %s -j %s --no-tests=error%s' "$1" "$(nproc)" "${2-}"; }

all_well

name='help says how it is called and runs nothing'
for option in --help -h; do
  run 0 --all "$option"
  expect out 'scripts/test [--all] [OPTION OF CTEST ...]'
  [ ! -s "$folder/log" ] || complain "$(cat "$folder/log")"
done

name='the quick form checks the formatting and runs the optimised tests alone'
run 0
expect log "$(quick_call)"
expect log 'clang-format --dry-run -Werror ./a.cpp'
expect forms 'test quick'
expect_none log 'asan\|fuzz\|analyse\|determinism\|coverage\|mutate'
expect out '100% tests passed, 0 tests failed out of 7'
expect out 'PASSED: the tests of build/test'
expect_none out FAILED

name='what tests left out is said once'
expect out 'left out of build/test: two things'
[ "$(grep -c '^left out' "$folder/out")" -eq 1 ] || complain "$(cat "$folder/out")"

name='the long form runs wide tests of both builds, and a share of each campaign'
run 0 --all
expect log "$(wide_call test)"
expect log "$(wide_call asan)"
expect forms 'test wide'
expect forms 'asan wide'
for call in 'fuzz all 10' 'analyse --quick' 'determinism --quick' 'coverage --quick' 'mutate --own --only hostutil --count 4'; do
  expect log "$call"
done
[ "$(grep -c '100% tests passed' "$folder/out")" -eq 2 ] || complain "$(cat "$folder/out")"

name='options of ctest reach it in both forms'
run 0 -R Lexer
expect log "$(quick_call ' -R Lexer')"
run 0 --all -R Lexer
expect log "$(wide_call test ' -R Lexer')"
expect log "$(wide_call asan ' -R Lexer')"
run 0 --rerun-failed --all
expect log "$(wide_call asan ' --rerun-failed')"

name='a failed test is a failure, and the rest runs nevertheless'
stand_in bin/ctest '[ "$2" != test ]'
run 1 --all
expect out 'FAILED: the tests of build/test'
expect out 'PASSED: the tests of build/asan'
expect log "$(wide_call asan)"
all_well

name='each campaign that finds something is a failure'
for program in fuzz analyse determinism coverage mutate; do
  stand_in "project/scripts/$program" 'exit 1'
  run 1 --all
  [ "$(grep -c '^FAILED: ' "$folder/out")" -eq 1 ] || complain "$program: $(cat "$folder/out")"
  all_well
done

name='a source that is not formatted is a failure'
stand_in bin/clang-format 'exit 1'
run 1
expect out 'FAILED: the formatting'
all_well

name='a build that fails is a status of its own'
stand_in bin/ninja 'exit 1'
run 10
expect_none log ctest
all_well

name='a machine that cannot be set up is a status of its own'
stand_in project/scripts/fuzz 'exit 10'
run 10 --all
expect_none log mutate

echo "$failures failures"
exit $((failures > 0))
