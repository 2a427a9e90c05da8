#!/bin/bash
# pages_test.sh TOOL SHARE: whether manual pages and completions in the folder are what the tool's help says.
#
# The completion for bash is run. Those for zsh and fish are parsed, and manual pages formatted, where the machine has
# what it takes; what was left out is counted.
set -u
export LC_ALL=C
tool=$1
share=$(cd -- "$2" && pwd -P)
failed=0
skipped=0
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
cd -- "$folder" || exit 1

expect() { # WHAT FOUND EXPECTED
  [ "$2" == "$3" ] && return
  printf '%s:\n found:    %s\n expected: %s\n' "$1" "$2" "$3"
  failed=$((failed + 1))
}

# shellcheck source=/dev/null
. "$share/bash-completion/completions/mayascene"

# What is proposed for the last word, sorted, in one line.
proposed() {
  COMP_WORDS=(mayascene "$@")
  COMP_CWORD=$#
  _mayascene
  printf '%s\n' ${COMPREPLY[@]+"${COMPREPLY[@]}"} | sort | paste -sd' '
}

# The options that the help shows, or the long ones of them, sorted, in one line.
options() { "$tool" "$@" --help-all | sed -n '/Exit status/q; s/^  \(-[^ ]*\) .*/\1/p' | tr ',' '\n' | sort | paste -sd' '; }

verbs='bake check export import prefs verify'
expect 'the verbs' "$(proposed '')" "$verbs"
expect 'the verbs of the help' "$("$tool" --help | sed -n '/^Verbs/,/^$/s/^  \([a-z]*\) .*/\1/p' | sort | paste -sd' ')" "$verbs"
expect 'a begun verb' "$(proposed ver)" verify
expect 'a verb below a verb' "$(proposed prefs '')" set
expect 'words of places' "$(proposed prefs set '')" '0 1 linear-units'

for verb in $verbs 'prefs set'; do
  # shellcheck disable=SC2086 # a verb can be two words
  expect "the options of $verb" "$(proposed $verb -)" "$(options $verb)"
  # shellcheck disable=SC2086
  for option in $(options $verb | tr ' ' '\n' | grep '^--'); do
    page=$share/man/man1/mayascene-${verb// /-}.1
    grep -qF -- "\\fB${option//-/\\-}\\fR" "$page" || expect "$page" "" "$option"
    grep -q -- "'[*]\{0,1\}$option\[" "$share/zsh/site-functions/_mayascene" || expect "zsh" "" "$option"
    grep -qF -- " -l ${option#--} " "$share/fish/vendor_completions.d/mayascene.fish" || expect "fish" "" "$option"
  done
done
formats=$("$tool" export --help | sed -n '/^Formats/,/^$/s/^  \([a-z]*\) .*/\1/p' | sort | paste -sd' ')
expect 'formats' "$(proposed export -f '')" "$formats"
expect 'some formats' "$([ "$(wc -w <<<"$formats")" -ge 3 ] && echo some)" some
expect 'a code' "$(proposed check --only MA0701)" MA0701
expect 'words after a sign' "$(proposed import --locators = al)" all
expect 'words after a sign alone' "$(proposed import --during =)" 'death entry import verify'
expect 'a number' "$(proposed import --step '')" ''

mkdir 'more shots'
touch 'shot one.ma' notes.txt
expect 'scenes and folders' "$(proposed import '')" 'more shots shot one.ma'
expect 'any file' "$(proposed import --json n)" notes.txt
expect 'a scene after options' "$(proposed check --strict --jobs 2 sh)" 'shot one.ma'

try() { # PROGRAM COMMAND...
  if ! command -v "$1" >/dev/null; then
    skipped=$((skipped + 1))
    return
  fi
  expect "$*" "$("$@" 2>&1 >/dev/null)" ''
}
try zsh -n "$share/zsh/site-functions/_mayascene"
try fish -n "$share/fish/vendor_completions.d/mayascene.fish"
for page in "$share"/man/man1/mayascene*.1; do
  try man --warnings -E UTF-8 -l "$page"
  try groff -ww -man -Tutf8 "$page"
done
expect 'manual pages' "$(find "$share/man/man1" -name 'mayascene*.1' | wc -l)" 8
echo "$skipped checks were left out: the machine lacks a program for them"
exit $((failed != 0))
