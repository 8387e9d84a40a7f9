# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# header_with <declarations>: a header of the platform layer.
header_with() {
  add_file src/0Platform/Core/Core.h <<<"$1"
}

# pinned_with <assertions>: the test of that header.
pinned_with() {
  add_file tests/0Platform/Core/CoreInterfaceTest.cpp <<<"$1"
}

accepts() {
  expect_success "$root/scripts/check-platform" "$project"
}

# rejects <name>
rejects() {
  expect_failure 1 "src/0Platform/Core/Core.h: no static assertion names $1" \
    "$root/scripts/check-platform" "$project"
}

WhatIsPinnedPasses() {
  header_with 'typedef long Index; extern "C" { Index length(Index, long); }'
  pinned_with 'static_assert(isType<Index, long> && isType<decltype(length), Index(Index, long)>);'
  accepts
}

AFunctionWithoutAnAssertionFails() {
  header_with $'extern "C" {\nvoid hold(void const* object);\nvoid\n  drop(int);\n}'
  pinned_with 'static_assert(isType<decltype(hold), void(void const*)>);'
  rejects drop
}

ATypeWithoutAnAssertionFails() {
  header_with 'typedef unsigned char Text[256];'
  pinned_with ''
  rejects Text
}

AConstantWithoutAnAssertionFails() {
  header_with 'extern "C" { extern Reference const kDefault; }'
  pinned_with 'static_assert(true);'
  rejects kDefault
}

AnEnumeratorWithoutAnAssertionFails() {
  header_with 'enum Order : long { kLess = -1L, kMore };'
  pinned_with 'static_assert(isKeptIn<Order, long> && kLess == -1);'
  rejects kMore
}

AnEnumerationWithoutANameIsReadToo() {
  header_with 'enum : unsigned long { kFlag = 64 };'
  pinned_with ''
  rejects kFlag
}

AStructureWithoutAnAssertionFails() {
  header_with 'struct Range { long location; }; typedef struct { int value; } Value;'
  pinned_with 'static_assert(sizeof(Range) == 8);'
  rejects Value
}

AnInlineFunctionWithoutAnAssertionFails() {
  header_with 'inline long twice(long value) { long const sum = value + value; return sum; }'
  pinned_with ''
  rejects twice
}

ANameInACommentOrOutsideAnAssertionPinsNothing() {
  header_with 'typedef long Index;'
  pinned_with '// static_assert(isType<Index, long>);
Index const index = 0;'
  rejects Index
}

ANameThatIsPartOfAnotherPinsNothing() {
  header_with 'typedef long Index;'
  pinned_with 'static_assert(isType<IndexPath, long>);'
  rejects Index
}

AModuleWithoutTestsFails() {
  header_with 'typedef long Index;'
  rejects Index
}

AHeaderOfTheImplementationIsNobodysInterface() {
  add_file src/0Platform/Core/_Imp/Table.h <<<'typedef long Entry;'
  accepts
}

run_case "$@"
