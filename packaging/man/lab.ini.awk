# lab.ini(5). First file: what "lumora --keys" prints, "[Section]" and "Key: what it allows". Second: the example, whose comments stand
# above the keys that they explain.
function roff(text) {
  gsub(/\\/, "\\e", text)
  gsub(/-/, "\\-", text)
  sub(/^[.']/, "\\\\\\&&", text)
  return text
}
# The keys of a section that the example does not give.
function others(section,   i, count, names) {
  count = split(keys[section], names, " ")
  for (i = 1; i <= count; i++)
    if (!(section names[i] in told)) print ".TP\n.B " roff(names[i]) "\nAllowed: " roff(allowed[section names[i]]) "."
}
FNR == NR && /^\[/ { section = $0; next }
FNR == NR && /: / {
  key = $0
  sub(/:.*/, "", key)
  sub(/^[^:]*: /, "")
  allowed[section key] = $0
  keys[section] = keys[section] key " "
  next
}
FNR == NR { next }
FNR == 1 {
  section = ""
  print ".TH LAB.INI 5 \"\" \"Lumora\" \"File formats\""
  print ".SH NAME\nlab.ini \\- what a photo lab decides for one machine with lumora(1)"
  print ".SH DESCRIPTION"
  sub(/^# lab.ini: /, "# This file holds ")
}
/^#/ { sub(/^# ?/, ""); words = words roff($0) "\n"; next }
/^\[/ {
  printf "%s", words
  words = ""
  if (FNR != NR) others(section)
  section = $0
  print ".SH " roff(section)
  next
}
/^[A-Za-z0-9]+ *=/ {
  key = value = $0
  sub(/ *=.*/, "", key)
  sub(/^[^=]*= */, "", value)
  print ".TP\n.B " roff(key)
  told[section key] = 1
  if (section key in allowed) print "Allowed: " roff(allowed[section key]) (value == "" ? "." : "; as in\n.IR \"" roff(value) "\" .")
  printf "%s", words
  words = ""
  next
}
/^$/ && words != "" { printf "%s", words; words = "" }
END {
  others(section)
  print ".SH SEE ALSO\nlumora(1), lumora\\-kiosk(8); /usr/share/lumora/lab.ini.example is this file to begin with."
}
