# Names each include that breaks a rule of check-includes, and fails where there is one. Takes the
# files by their paths from the project's folder.

function complain(text) {
  print FILENAME ":" FNR ": " text
  failed = 1
}

function first(path) {
  sub(/\/.*/, "", path)
  return path
}

# The module that an _Imp header belongs to, else nothing.
function owner(path) {
  return sub(/\/_Imp\/.*/, "", path) ? path : ""
}

BEGIN {
  count = split("0Platform 1Base 2System 3Util QORNOpenOfficeLibrary", names)
  for (i = 1; i <= count; ++i) {
    floor[names[i]] = i
  }
}

FNR == 1 {
  tree = first(FILENAME)
  inner = FILENAME
  sub(/^[^\/]*\//, "", inner)
  here = first(inner)
}

/^[ \t]*#[ \t]*(include|include_next|import)([^a-z_]|$)/ {
  target = $0
  sub(/^[ \t]*#[ \t]*[a-z_]+[ \t]*/, "", target)
  mark = substr(target, 1, 1)
  sub(/^["<]/, "", target)
  sub(/[">].*/, "", target)
  there = first(target)

  if (mark != "\"" && mark != "<") {
    complain("an include that cannot be read")
    next
  }
  if (mark == "\"" && !(there in floor) && !(tree != "src" && there == "support")) {
    complain("\"" target "\" is not a path from src/")
  }
  if (mark == "<" && there in floor) {
    complain("<" target "> belongs in quotes")
  }
  if (tree == "src" && there in floor && floor[there] > floor[here]) {
    complain(here " includes upward: " target)
  }
  module = owner(target)
  if (module != "" && index(inner, module "/") != 1) {
    complain(target " is private to " module)
  }
  if (here != "0Platform" && target ~ /(^|\/)CoreFoundation\// &&
      !(mark == "<" && target == "CoreFoundation/CoreFoundation.h")) {
    complain("the platform is <CoreFoundation/CoreFoundation.h>, not " target)
  }
}

END {
  exit failed
}
