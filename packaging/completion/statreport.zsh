#compdef statreport
# SPDX-License-Identifier: MIT

_statreport() {
  local -a common data
  common=(
    '(-h --help)'{-h,--help}'[show a help text]'
    '(-v --version)'{-v,--version}'[show the version]'
    '--json-errors[write errors as one line of JSON each]'
    '--language=[language of texts and reports]:language:(English German French Spanish Italian Russian Japanese Korean Arabic ChineseSimple ChineseTraditional Slovakian)'
    '(-q --quiet)'{-q,--quiet}'[write no notes and no progress]'
  )
  data=(
    '(--table)--session=[measurements\: a session of the Measuring Desk]:session:_files -g "*.json(-.)"'
    '(--session)--table=[measurements\: a table]:table:_files -g "*.(csv|tsv|tab|txt|xls|json)(-.)"'
    '*--unit=[unit of values that state none, or Name=unit]:unit:'
    '--type-column=[column with the object types]:column:'
    '--name-column=[column with the object names]:column:'
    '--decimal=[decimal mark]:mark:(point comma)'
    '--digits=[significant digits, 0 is automatic]:count:'
  )
  if (( CURRENT == 2 )); then
    local -a commands
    commands=('render:print a report' 'stats:print statistics' 'check:say what a template holds' 'blocks:list the block types')
    _describe command commands
    _arguments $common
    return
  fi
  local command=$words[2]
  shift words
  (( CURRENT-- ))
  case $command in
  render)
    _arguments $common $data '--image=[the image that was measured]:image:_files' \
      '(-o --output)'{-o,--output=}'[the PDF file to write]:PDF file:_files -g "*.pdf(-.)"' \
      '1:template:_files -g "*.rtp(-.)"' ;;
  stats)
    _arguments $common $data '--group-by=[groups]:grouping:(object measurement)' '--format=[output]:format:(text csv json)' ;;
  check) _arguments $common '1:template:_files -g "*.rtp(-.)"' ;;
  blocks) _arguments $common '--format=[output]:format:(text json)' ;;
  esac
}

_statreport "$@"
