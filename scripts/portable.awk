# Names each line of a shell script that the bash 3.2 or the tools of macOS do not understand, and
# fails where there is one. Takes all scripts that work together, since an array may begin empty in
# one and be used in another.

function forbid(regex, reason) {
  forbidden[++rules] = regex
  reasons[rules] = reason
}

function forbid_word(word, reason) {
  forbid("(^|[^[:alnum:]_./-])" word "([^[:alnum:]_-]|$)", reason)
}

# Of the tool's options those of the letters, and all long ones.
function forbid_options(tool, letters, one) {
  one = letters == "" ? "-[[:alpha:]]" : "(-[[:alpha:]]|[[:alnum:]]*[" letters "])"
  forbid("(^|[^[:alnum:]_./-])" tool "( +-[[:alnum:]]+)* +-" one, tool " has no such option there")
}

function complain(file, line, reason) {
  print file ":" line ": " reason
  failed = 1
}

# Whether the text expands the array although it may hold nothing: neither in the form that allows
# for that, nor behind a question for the number of its elements.
function expands_bare(text, array) {
  gsub("\\$\\{" array "\\[@\\]\\+\"\\$\\{" array "\\[@\\]\\}\"\\}", "", text)
  return text ~ "\\$\\{" array "\\[[@*]\\]" && text !~ "\\$\\{#" array "\\[@\\]\\}"
}

BEGIN {
  bash = "is newer than bash 3.2"
  forbid_word("(mapfile|readarray|coproc)", bash)
  forbid_word("wait -n", bash)
  forbid_word("(globstar|lastpipe|inherit_errexit)", bash)
  forbid_word("(BASHPID|EPOCHSECONDS|EPOCHREALTIME|SRANDOM)", bash)
  forbid_word("(declare|local|typeset) +-[a-z]*[Agnlu]", bash)
  forbid("\\$\\{[[:alnum:]_]+(\\[[^]]*\\])?(,|\\^)", "a change of case " bash)
  forbid("\\$\\{[[:alnum:]_]+@[[:alpha:]]", "a transformation " bash)
  forbid("\\$\\{[[:alnum:]_]+:[^}]*:-[0-9]", "a negative length " bash)
  forbid("\\$\\{[[:alnum:]_]+\\[-", "a negative index " bash)
  forbid("\\[\\[ .*-v ", "the test for a variable " bash)
  forbid("(&>>|\\|&|;&|;;&)", bash)
  forbid("%\\(.*\\)T", "the format of times " bash)
  forbid("\\{[[:alpha:]_]+\\}[<>]", "a number for a new stream " bash)
  forbid_word("(declare|local|typeset) +[[:alnum:]_ ]+=\\([^)]",
    "bash 3.2 expands what is assigned here twice")

  forbid_word("(nproc|getent|tac|timeout|shuf|realpath|md5sum|sha256sum)", "macOS has no such tool")
  forbid_options("sed", "irz")
  forbid_options("grep", "Pz")
  forbid_options("sort", "z")
  forbid_options("cut", "z")
  forbid_options("xargs", "rd")
  forbid_options("readlink", "em")
  forbid_options("mktemp")
  forbid_options("stat", "c")
  forbid_options("date", "d")
  forbid_options("cp", "ta")
  forbid_options("ls")
  forbid_options("rm")
}

/^[[:space:]]*#/ {
  next
}

{
  for (i = 1; i <= rules; ++i) {
    if ($0 ~ forbidden[i]) {
      complain(FILENAME, FNR, reasons[i])
    }
  }
  ++count
  text[count] = $0
  place[count] = FILENAME
  number[count] = FNR
  rest = $0
  while (match(rest, /[[:alpha:]_][[:alnum:]_]*=\(\)/)) {
    empty[substr(rest, RSTART, RLENGTH - 3)] = 1
    rest = substr(rest, RSTART + RLENGTH)
  }
}

END {
  for (i = 1; i <= count; ++i) {
    for (array in empty) {
      if (expands_bare(text[i], array)) {
        complain(place[i], number[i], "to bash 3.2 an empty " array " is unset here")
      }
    }
  }
  exit failed
}
