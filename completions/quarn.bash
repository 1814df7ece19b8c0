# SPDX-License-Identifier: Apache-2.0
# shellcheck shell=bash
#
# Completion for quarn, quarn-ar, quarn-ranlib and quarn-json in bash: options, their values, letters, the
# archive, its members, and files. It asks the program itself for the names of members. What can't be read
# completes to nothing, without a word.

__quarn_letters='-a -b -C -c -d -h -i -m -n -p -q -r -s -T -t -u -V -v -x'
__quarn_names='--create --debug_symbols --entries --help --new_files_only --no_debug_symbols
  --no_qobix_buildattr --no_unique_symbols --qobix_buildattr --show_cmdline --sizes --unique_symbols
  --version --version_number --vsn --zs --zt'
__quarn_names_with_value='--db_check= --diag_error= --diag_remark= --diag_style= --diag_suppress=
  --diag_warning= --libattrmap= --message_locale= --no_normalise= --normalise= --via='

__quarn_styles='zev gnu ide devstudio list'
__quarn_locales='en_US ja_JP en_US.UTF-8 ja_JP.UTF-8 UTF-8'
__quarn_levels='none low medium high extravagant show'
__quarn_warnings='L3910 L3920 L6831 L6874 L6875 L6876 L6877 L6974'

__quarn_ar_operations='dmpqrstx'
__quarn_ar_modifiers='abcCDfilNoPsSTuUvV'
# Letters that not all operations know, each with those that do.
__quarn_ar_restricted='a:mr b:mr C:x i:mr N:dx o:x P:dmpqrst S:dmpqrtx T:x u:r'
__quarn_ar_names='--diag_error= --diag_remark= --diag_style= --diag_suppress= --diag_warning= --help
  --libattrmap= --plugin= --qobix_buildattr --rsp-quoting= --target= --version'

__quarn_json_names='--help --libattrmap= --qobix_buildattr --version'

# The words of the line, in $words, with the one at the cursor, up to there, in $cword. The shell divides
# words at characters such as "=" and ":", which are put together again, and has no word for a cursor between
# blanks.
__quarn_split() {
  local line=$COMP_LINE part at start isJoined isCut=''
  words=() cword=0
  for at in "${!COMP_WORDS[@]}"; do
    part=${COMP_WORDS[at]}
    isJoined=''
    if (( at > 0 )) && [[ -n $line && $line != [[:space:]]* ]]; then isJoined=yes; fi
    [[ -z $part ]] || line=${line#"${line%%[![:space:]]*}"}
    start=$(( ${#COMP_LINE} - ${#line} ))
    line=${line#"$part"}
    if (( at == COMP_CWORD && COMP_POINT < start + ${#part} )); then
      if [[ -z $isJoined ]] && (( COMP_POINT <= start )); then
        words+=('')
        cword=$(( ${#words[@]} - 1 ))
      else
        part=${part:0:COMP_POINT > start ? COMP_POINT - start : 0} isCut=now
      fi
    fi
    if [[ -z $isJoined ]]; then
      words+=("$part")
    elif [[ $isCut != yes ]]; then
      words[-1]+=$part
    fi
    if (( at == COMP_CWORD && cword == 0 )); then cword=$(( ${#words[@]} - 1 )); fi
    isCut=${isCut:+yes}
    [[ $line != [[:space:]]* ]] || isCut=''
  done
}

# What a word means to the shell, in $REPLY: quotes go away, and "~/" is the home folder. Nothing is run.
__quarn_unquote() {
  local text=$1 quote='' character
  REPLY=''
  if [[ $text = \~/* ]]; then REPLY=$HOME/ text=${text#\~/}; fi
  while [[ -n $text ]]; do
    character=${text:0:1} text=${text:1}
    if [[ $quote = "'" && $character != "'" ]]; then
      REPLY+=$character
    elif [[ $character = \\ ]]; then
      REPLY+=${text:0:1} text=${text:1}
    elif [[ -n $quote && $character = "$quote" ]]; then
      quote=''
    elif [[ -z $quote && ( $character = \' || $character = \" ) ]]; then
      quote=$character
    else
      REPLY+=$character
    fi
  done
}

# Whether a word is an option whose value is the next word.
__quarn_takes_next() {
  [[ $1 = -[abi] ]] && return
  [[ $1 = --* && " ${__quarn_names_with_value//$'\n'/ } " = *" $1= "* ]]
}

# Looks at all words but the one at the cursor, behind which the archive may stand too: the archive in
# $archive, the options in $seen, and in $option the one whose value is at the cursor.
# $place is the number of words in front of the cursor that are no options; $ended, whether "--" is there.
__quarn_scan() {
  local at word isValue=''
  archive='' seen=() option='' place=0 ended=''
  for (( at = 1; at < ${#words[@]}; ++at )); do
    word=${words[at]}
    if (( at == cword )); then
      option=$isValue isValue=''
    elif [[ -n $isValue ]]; then
      isValue=''
    elif [[ $word = -- && -z $ended ]]; then
      ended=yes
      # Behind the cursor it says nothing of the word there.
      if (( at > cword )); then ended=later; fi
    elif [[ $word = -?* && -z $ended ]]; then
      seen+=("$word")
      if __quarn_takes_next "$word"; then isValue=$word; fi
    else
      if (( at < cword )); then place=$(( place + 1 )); fi
      if [[ -z $archive ]]; then __quarn_unquote "$word"; archive=$REPLY; fi
    fi
  done
  if [[ $ended = later ]]; then ended=''; fi
}

# Whether one of these letters has been given, alone or among others.
__quarn_has_letter() {
  local word
  for word in "${seen[@]}"; do
    [[ $word = -[abi]* || $word = --* ]] && continue
    [[ $word = -*[$1]* ]] && return
  done
  return 1
}

# The members of the archive. A control character, which the program shows by its number, is any character. A
# name that begins as an option does gets a folder, which does not count.
__quarn_members() {
  local program name
  [[ -n $archive && -f $archive ]] || return
  __quarn_unquote "${words[0]}"
  program=$REPLY
  while IFS= read -r name; do
    while [[ $name =~ ^(.*)\\[01][0-7][0-7](.*)$ ]]; do name=${BASH_REMATCH[1]}\?${BASH_REMATCH[2]}; done
    [[ $name != -* ]] || name=./$name
    printf '%s\n' "$name"
  done < <("$program" -t -- "$archive" 2> /dev/null < /dev/null)
}

# Offers the lines of the input that begin as $current does, each behind $before.
__quarn_offer_lines() {
  local line
  while IFS= read -r line; do
    [[ -n $line && $line = "$current"* ]] && COMPREPLY+=("$before$line")
  done
}

__quarn_offer_words() {
  # shellcheck disable=SC2086
  __quarn_offer_lines < <(printf '%s\n' $1)
}

# Names of members are quoted here, in the way that the word at the cursor is, as the shell itself quotes only
# names of files.
__quarn_offer_members() {
  local at quote=${words[cword]:0:1} name
  # Behind a letter the shell replaces what is in the quotes, and nothing in front of them.
  if [[ ${words[cword]} =~ ^-[abi]=?([\'\"]) ]]; then quote=${BASH_REMATCH[1]} before=''; fi
  __quarn_offer_lines < <(__quarn_members)
  for at in "${!COMPREPLY[@]}"; do
    name=${COMPREPLY[at]}
    case $quote in
      \') name=${name//\'/\'\\\'\'} ;;
      \") name=${name//\\/\\\\} name=${name//\"/\\\"} name=${name//\$/\\\$} name=${name//\`/\\\`} ;;
      *) printf -v name %q "$name" ;;
    esac
    COMPREPLY[at]=$name
  done
}

__quarn_offer_files() {
  compopt -o filenames 2> /dev/null
  __quarn_offer_lines < <(compgen -f -- "$current")
}

# Names that end as archives do, and folders; whatever there is where no name does.
__quarn_offer_archives() {
  compopt -o filenames 2> /dev/null
  if compgen -f -X '!*.a' -- "$current" > /dev/null; then
    __quarn_offer_lines < <(compgen -f -X '!*.a' -- "$current")
    __quarn_offer_lines < <(compgen -d -- "$current")
  else
    __quarn_offer_files
  fi
}

# Of a list only the element at the cursor is completed.
__quarn_offer_element() {
  if [[ $current = *,* ]]; then
    before+=${current%,*},
    current=${current##*,}
  fi
  "$@"
}

__quarn_offer_value() {
  case $1 in
    -a | -b | -i) __quarn_offer_members ;;
    --db_check) __quarn_offer_words "$__quarn_levels" ;;
    --diag_remark) __quarn_offer_element __quarn_offer_words "$__quarn_warnings" ;;
    --diag_error | --diag_suppress | --diag_warning)
      __quarn_offer_element __quarn_offer_words "warning $__quarn_warnings" ;;
    --diag_style) __quarn_offer_words "$__quarn_styles" ;;
    --message_locale) __quarn_offer_words "$__quarn_locales" ;;
    --libattrmap) __quarn_offer_files ;;
    --via) __quarn_offer_element __quarn_offer_files ;;
    --plugin) __quarn_offer_files ;;
    --rsp-quoting) __quarn_offer_words 'posix windows' ;;
    --target) __quarn_offer_words 'default binary' ;;
  esac
}

__quarn_offer_options() {
  __quarn_offer_words "$1"
  [[ ${#COMPREPLY[@]} = 1 && ${COMPREPLY[0]} = *= ]] && compopt -o nospace 2> /dev/null
}

# A word behind the archive: a member for who reads or edits, a file for who inserts.
__quarn_offer_word() {
  local options=" ${seen[*]} "
  if [[ $options = *' --create '* ]] || __quarn_has_letter rq; then
    __quarn_offer_files
  elif __quarn_has_letter dmptx; then
    __quarn_offer_members
  elif [[ $options != *' --'@(entries|sizes|zs|zt)' '* ]] && ! __quarn_has_letter s; then
    __quarn_offer_files
  fi
}

# The shell replaces only what is behind the last "=" or ":" of a word, so the rest is taken off what is
# offered.
__quarn_drop_head() {
  local head=${words[cword]} at breaks=${COMP_WORDBREAKS//[!=:]/}
  [[ -n $breaks && $head != [\'\"]* ]] || return
  head=${head%"${head##*["$breaks"]}"}
  for at in "${!COMPREPLY[@]}"; do COMPREPLY[at]=${COMPREPLY[at]#"$head"}; done
}

_quarn() {
  local words cword archive seen option place ended current before='' REPLY
  COMPREPLY=()
  __quarn_split
  __quarn_scan
  __quarn_unquote "${words[cword]}"
  current=$REPLY
  if [[ -n $option ]]; then
    __quarn_offer_value "$option"
  elif [[ -z $ended && $current = --*=* ]]; then
    option=${current%%=*} before=$option= current=${current#*=}
    __quarn_offer_value "$option"
  elif [[ -z $ended && $current = -[abi]?* ]]; then
    option=${current:0:2} before=$option current=${current:2}
    if [[ $current = =* ]]; then before+='=' current=${current:1}; fi
    __quarn_offer_value "$option"
  elif [[ -z $ended && $current = -* ]]; then
    __quarn_offer_options "$__quarn_letters $__quarn_names $__quarn_names_with_value"
  elif (( place == 0 )); then
    __quarn_offer_archives
  else
    __quarn_offer_word
  fi
  __quarn_drop_head
}

# The words of quarn-ar but its options: its letters in $letters, the others in $operands, with an empty one at
# the cursor, which is number $place. In $option the one whose value is at the cursor.
__quarn_ar_scan() {
  local at word isValue='' ended=''
  letters='' operands=() place=-1 option=''
  for (( at = 1; at < ${#words[@]}; ++at )); do
    word=${words[at]}
    if [[ -n $isValue ]]; then
      if (( at == cword )); then option=$isValue; fi
      isValue=''
    elif [[ $word = -- && -z $ended ]] && (( at != cword )); then
      ended=yes
    elif [[ $word = -?* && -z $ended ]]; then
      if [[ " $__quarn_ar_names " = *[[:space:]]"$word="* ]]; then isValue=$word; fi
      if [[ $word != --* ]] && (( at != cword )); then letters+=${word#-}; fi
    elif [[ -z $isRanlib && $letters != *["$__quarn_ar_operations"]* ]] && (( at < cword )); then
      letters+=$word
    else
      if (( at == cword )); then place=${#operands[@]} word=''; fi
      __quarn_unquote "$word"
      operands+=("$REPLY")
    fi
  done
}

# The word of letters at the cursor, as it is and with each letter that may follow.
__quarn_ar_offer_letters() {
  local at letter known=$letters${current#-} operation knows
  operation=${known//[!"$__quarn_ar_operations"]/}
  operation=${operation:0:1}
  if [[ -z $operation ]]; then
    for (( at = 0; at < ${#__quarn_ar_operations}; ++at )); do
      COMPREPLY+=("$current${__quarn_ar_operations:at:1}")
    done
    return
  fi
  COMPREPLY=("$current")
  for (( at = 0; at < ${#__quarn_ar_modifiers}; ++at )); do
    letter=${__quarn_ar_modifiers:at:1}
    [[ $known != *"$letter"* ]] || continue
    knows=" $__quarn_ar_restricted "
    if [[ $knows = *" $letter:"* ]]; then
      knows=${knows#* "$letter":}
      [[ ${knows%% *} = *"$operation"* ]] || continue
    fi
    COMPREPLY+=("$current$letter")
  done
}

# An operand: a place and a count, if the letters want them, the archive, and what is in it or goes into it.
__quarn_ar_offer_operand() {
  local needed=0 archive
  if [[ $letters = *[abi]* ]]; then needed=$(( needed + 1 )); fi
  if [[ $letters = *N* ]]; then needed=$(( needed + 1 )); fi
  archive=${operands[needed]-}
  if [[ -n $isRanlib ]] || (( place == needed )); then
    __quarn_offer_archives
  elif (( place == 0 )) && [[ $letters = *[abi]* ]]; then
    __quarn_offer_members
  elif (( place > needed )) && [[ $letters = *[rq]* ]]; then
    __quarn_offer_files
  elif (( place > needed )) && [[ $letters = *[dmptx]* ]]; then
    __quarn_offer_members
  fi
}

_quarn_ar() {
  local words cword letters operands place option current before='' REPLY isRanlib=''
  [[ $1 != *ranlib ]] || isRanlib=yes
  COMPREPLY=()
  __quarn_split
  __quarn_ar_scan
  __quarn_unquote "${words[cword]}"
  current=$REPLY
  if [[ -n $option ]]; then
    __quarn_offer_value "$option"
  elif [[ $current = --*=* ]]; then
    option=${current%%=*} before=$option= current=${current#*=}
    __quarn_offer_value "$option"
  elif [[ $current = --* ]]; then
    __quarn_offer_options "$__quarn_ar_names"
  elif [[ $current = @* ]]; then
    before=@ current=${current#@}
    __quarn_offer_files
  elif [[ -n $isRanlib && $current = -* ]]; then
    __quarn_offer_options "-D -h -t -U -v -V $__quarn_ar_names"
  elif [[ -z $isRanlib && ( $current = -* || $letters != *["$__quarn_ar_operations"]* ) ]]; then
    __quarn_ar_offer_letters
  else
    __quarn_ar_offer_operand
  fi
  __quarn_drop_head
}

# Each word that is no option is a library.
_quarn_json() {
  local words cword archive seen option place ended current before='' REPLY
  COMPREPLY=()
  __quarn_split
  __quarn_scan
  __quarn_unquote "${words[cword]}"
  current=$REPLY
  if [[ -z $option && -z $ended && $current = --*=* ]]; then
    option=${current%%=*} before=$option= current=${current#*=}
  fi
  if [[ -n $option ]]; then
    [[ $option != --libattrmap ]] || __quarn_offer_files
  elif [[ -z $ended && $current = -* ]]; then
    __quarn_offer_options "$__quarn_json_names"
  else
    __quarn_offer_archives
  fi
  __quarn_drop_head
}

complete -F _quarn quarn
complete -F _quarn_ar quarn-ar quarn-ranlib
complete -F _quarn_json quarn-json
