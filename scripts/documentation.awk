# Reads one header or page as Doxygen calls it, and writes what Doxygen understands, line by line:
#
# - A header's first comment is that of the file.
# - A page is named after its file, "guide-files" for docs/files.md, and so are its headings, as
#   "guide-files-across-volumes", so that links lead to them.
# - A link to one of the documentation's pages, a heading or a header is a reference, which Doxygen looks up; the README's
#   links to pages make these the pages below it. Any other link leads to the file in the project,
#   and one to a file that is missing to nothing, which Doxygen complains of.

FNR == 1 {
  root = ENVIRON["PWD"] "/"
  path = FILENAME
  if (index(path, root) == 1) {
    path = substr(path, length(root) + 1)
  }
  folder = path
  if (!sub(/[^\/]*$/, "", folder)) {
    folder = ""
  }
  if (path ~ /\.h$/ && !sub(/^\/\/\/ ?/, "/// @file\\ilinebr ")) {
    printf "/** @file */ "
  }
}

path ~ /\.h$/ {
  print
  next
}

/^ *```/ {
  fenced = !fenced
}

fenced || /^ *```/ {
  print
  next
}

/^#+ / {
  label = FNR == 1 ? page_label(path) : page_label(path) "-" slug($0)
  if (label in used) {
    label = label "-" used[label]++
  } else {
    used[label] = 1
  }
  if (path != "README.md" || FNR > 1) {
    $0 = $0 " {#" label "}"
  }
}

{
  print with_links($0)
}

# The name that GitHub gives to a heading.
function slug(heading) {
  sub(/^#+ */, "", heading)
  heading = tolower(heading)
  gsub(/[^a-z0-9 _-]/, "", heading)
  gsub(/ /, "-", heading)
  return heading
}

function page_label(file) {
  if (file == "README.md") {
    return "guide-readme"
  }
  sub(/^docs\//, "", file)
  sub(/\.md$/, "", file)
  gsub(/[^A-Za-z0-9]/, "-", file)
  return "guide-" tolower(file)
}

function with_links(line,    done, start, target, text, opening) {
  done = ""
  while (match(line, /\]\([^()]*\)/)) {
    target = substr(line, RSTART + 2, RLENGTH - 3)
    text = substr(line, 1, RSTART - 1)
    line = substr(line, RSTART + RLENGTH)
    opening = last_bracket(text)
    if (path == "README.md" && opening && target ~ /^docs\/[a-z]*\.md$|^[A-Z]*\.md$/ &&
        !(target in below)) {
      below[target] = 1
      done = done substr(text, 1, opening - 1) \
        "@subpage " page_label(target) " \"" substr(text, opening + 1) "\""
    } else if (opening > 1 && substr(text, opening - 1, 1) == "!") {
      done = done text "](" picture(target) ")"
    } else if (opening && reference(target) ~ /^\.\./) {
      # As a link of Markdown one to a page that is not ours would be looked up.
      done = done substr(text, 1, opening - 1) \
        "<a href=\"" reference(target) "\">" substr(text, opening + 1) "</a>"
    } else if (opening) {
      # Within the text of a reference Doxygen shows backquotes as they are.
      done = done substr(text, 1, opening) without_quotes(substr(text, opening + 1)) \
        "](" reference(target) ")"
    } else {
      done = done text "](" reference(target) ")"
    }
  }
  return done line
}

function without_quotes(text) {
  gsub(/`/, "", text)
  return text
}

function last_bracket(text,    i) {
  for (i = length(text); i > 0 && substr(text, i, 1) != "["; --i) {
  }
  return i
}

function reference(target,    file, heading, parts) {
  if (target ~ /^[a-z]+:/) {
    return target
  }
  split(target, parts, "#")
  file = parts[1] == "" ? path : resolved(folder parts[1])
  heading = parts[2]
  if (file ~ /^(docs\/)?[^\/]*\.md$/) {
    if (file == "README.md" && heading == "") {
      return "@ref index"
    }
    return "@ref " page_label(file) (heading == "" ? "" : "-" heading)
  }
  if (!exists(file)) {
    return "@ref missing: " file
  }
  if (file ~ /^src\/.*\.h$/) {
    sub(/.*\//, "", file)
    return "@ref " file
  }
  return "../../../" file
}

function picture(target,    file) {
  file = resolved(folder target)
  if (!exists(file)) {
    return "@ref missing: " file
  }
  sub(/.*\//, "", file)
  return file
}

function resolved(file) {
  while (file ~ /(^|\/)[^\/.][^\/]*\/\.\.\//) {
    sub(/[^\/.][^\/]*\/\.\.\//, "", file)
  }
  return file
}

function exists(file) {
  gsub(/'/, "'\\''", file)
  return system("test -e '" file "'") == 0
}
