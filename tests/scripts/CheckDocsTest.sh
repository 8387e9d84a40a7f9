# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# A project of one page and one header, which the standard input fills between its guards.
project_with_header() {
  mkdir -p -- "$project"/{scripts,docs/pictures,src/{2System,3Util,QORNOpenOfficeLibrary}}
  cp -- "$root/scripts/documentation.awk" "$project/scripts/"
  add_file docs/Doxyfile <"$root/docs/Doxyfile"
  add_file CMakeLists.txt <<<'project(qorn VERSION 1.2.3 LANGUAGES CXX)'
  add_file README.md <<<$'# Project\n\nSee [the page](docs/page.md) and [the other](docs/other.md).'
  add_file CHANGELOG.md <<<$'# Changes\n\n## [1.2.3] - 2026-11-22'
  add_file CONTRIBUTING.md <<<'# How'
  add_file docs/page.md <<'END'
# A page

## Two words

Here.
END
  add_file docs/other.md <<<'# Another'
  {
    printf '%s\n' '/// Sums.' '#ifndef A_H' '#define A_H' '/// Numbers.' 'namespace A {'
    cat
    printf '%s\n' '}' '#endif'
  } | add_file src/1Base/A/A.h
}

passes() {
  commit_all
  expect_success "$root/scripts/check-docs" "$project"
}

# rejects <text>
rejects() {
  commit_all
  expect_failure 1 "$1" "$root/scripts/check-docs" "$project"
}

AProjectWithCommentsPasses() {
  project_with_header <<'END'
/// The sum of both.
///     sum(1, 2)   // 3
int sum(int a, int b);

/// @{
/// The same of wider ones.
long sum(long a, long b);
long long sum(long long a, long long b);
/// @}

namespace Detail {
int inner();
}
END
  passes
}

AFunctionWithoutCommentFails() {
  project_with_header <<'END'
/// The sum of both.
int sum(int a, int b);
int difference(int a, int b);
END
  rejects "src/1Base/A/A.h:8: error: Member difference(int a, int b) (function) of namespace A is not documented"
  expect_not_said "Member sum"
}

AClassWithoutCommentFails() {
  project_with_header <<<'struct CSum { int value; };'
  rejects "Compound A::CSum is not documented"
}

AMemberWithoutCommentFails() {
  project_with_header <<'END'
/// A sum.
class CSum {
  public:
    int get() const { return sum_; }
  private:
    int sum_;
};
END
  rejects "Member get() const (function) of class A::CSum is not documented"
  expect_not_said "sum_ ("
}

AnAliasWithoutCommentFails() {
  project_with_header <<<'using TSum = int;'
  rejects "Member TSum (typedef) of namespace A is not documented"
}

AMacroWithoutCommentFails() {
  project_with_header <<<'#define SUM(a, b) ((a) + (b))'
  rejects "Member SUM(a, b) (macro definition) of file A.h is not documented"
}

AParameterThatThereIsNotFails() {
  project_with_header <<'END'
/// The sum of both.
/// @param c the third
int sum(int a, int b);
END
  rejects "argument 'c'"
}

AHeaderThatDoesNotSayWhatItIsForFails() {
  project_with_header </dev/null
  add_file "src/1Base/A/A b.h" <<<'int outside();'
  rejects "src/1Base/A/A b.h: does not begin with a comment"
}

APrivateHeaderNeedsNone() {
  project_with_header </dev/null
  add_file src/1Base/A/_Imp/AInner.h <<<'int inner();'
  passes
}

LinksThatLeadSomewherePass() {
  project_with_header </dev/null
  add_file README.md <<'END'
# Project

See [the page](docs/page.md), [its words](docs/page.md#two-words), [the other](docs/other.md),
[the header](src/1Base/A/A.h) and [the sources](CMakeLists.txt).
END
  add_file docs/other.md <<'END'
# Another

[Back](../README.md), [there](page.md#two-words), [here](#twice), [again](#twice-1).

## Twice

## Twice

```
[not a link](nowhere.md)
```
END
  passes
}

ALinkToNoPageFails() {
  project_with_header </dev/null
  add_file docs/other.md <<'END'
# Another

See [that](nowhere.md).
END
  rejects "docs/other.md:3: error: unable to resolve reference to 'guide-nowhere'"
}

ALinkToNoHeadingFails() {
  project_with_header </dev/null
  add_file docs/other.md <<'END'
# Another

See [that](page.md#three-words).
END
  rejects "docs/other.md:3: error: unable to resolve reference to 'guide-page-three-words'"
}

ALinkToNoFileFails() {
  project_with_header </dev/null
  add_file docs/other.md <<'END'
# Another

See [that](../src/Nothing.cpp).
END
  rejects "docs/other.md:3"
}

APageThatNobodyLinksFails() {
  project_with_header </dev/null
  add_file docs/lonely.md <<<'# Lonely'
  rejects "docs/lonely.md: no link in README.md leads there"
}

AFileThatIsNamedAndNotThereFails() {
  project_with_header </dev/null
  add_file docs/other.md <<'END'
# Another

See `src/1Base/A`, `src/1Base/A/A.h`, `src/1Base/*/_Imp` and `src/1Base/A/B.h`.
END
  rejects "docs/other.md:3: names src/1Base/A/B.h, which there is not"
  expect_not_said "A.h, which"
}

APictureThatIsMissingFails() {
  project_with_header </dev/null
  add_file docs/other.md <<'END'
# Another

![A picture](pictures/none.svg)
END
  rejects "docs/other.md:3"
}

AChangelogWithoutTheVersionFails() {
  project_with_header </dev/null
  add_file CHANGELOG.md <<<$'# Changes\n\n## [1.2.2] - 2026-11-22'
  rejects "CHANGELOG.md: has no section for version 1.2.3"
}

# picture_of <hash>
picture_of() {
  add_file docs/pictures/a.dot <<<'digraph { a -> b }'
  add_file docs/pictures/a.svg <<END
<svg xmlns="http://www.w3.org/2000/svg"/>
<!-- scripts/docs drew this from a.dot, $1 -->
END
}

APictureOfItsSourcePasses() {
  project_with_header </dev/null
  picture_of "$(git hash-object --stdin <<<'digraph { a -> b }')"
  passes
}

APictureOfAnotherSourceFails() {
  project_with_header </dev/null
  picture_of "$(git hash-object --stdin <<<'digraph { b -> a }')"
  rejects "docs/pictures/a.dot: its picture is missing or older"
}

run_case "$@"
