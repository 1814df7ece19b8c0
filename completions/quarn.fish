# SPDX-License-Identifier: Apache-2.0
#
# Completion for quarn, quarn-ar, quarn-ranlib and quarn-json in fish: options, their values, letters, the
# archive, its members, and files. It asks the program itself for the names of members. What can't be read
# completes to nothing, without a word.

# Of the words of a command line the options, or those that are neither options nor values of theirs.
function __quarn_pick --argument-names kind
    set -l with_value '^(-[abi]|--(db_check|diag_[a-z]+|libattrmap|message_locale|(no_)?normalise|via))$'
    set -l is_value no
    set -l ended no
    for word in $argv[2..]
        if test $is_value = yes
            set is_value no
        else if test $ended = no; and test "$word" = --
            set ended yes
        else if test $ended = no; and string match -qr -- '^-.' $word
            string match -qr -- $with_value $word; and set is_value yes
            test $kind = options; and printf '%s\n' $word
        else if test $kind = words; and test "$word" != ''
            printf '%s\n' $word
        end
    end
end

# All words behind the program's name but the one at the cursor, whose place stays empty. The archive may
# stand behind the cursor too.
function __quarn_others
    set -l before (commandline -opc)
    set -l all (commandline -op)
    set -l next (math (count $before) + 1)
    set -l current (commandline -t)
    test -n "$current"; and set next (math $next + 1)
    printf '%s\n' $before[2..] '' $all[$next..]
end

function __quarn_has --argument-names letters names
    __quarn_pick options (__quarn_others) | string match -qr -- "^(-(?![abi-]).*[$letters].*|--($names))\$"
end

function __quarn_wants_archive
    test (count (__quarn_pick words (commandline -opc)[2..])) = 0
end

# A member for who reads or edits, a file for who inserts.
function __quarn_wants_files
    not __quarn_wants_archive; and not __quarn_wants_members
    and begin
        __quarn_has rq create
        or not __quarn_has s 'entries|sizes|zs|zt'
    end
end

function __quarn_wants_members
    not __quarn_wants_archive; and __quarn_has dmptx -; and not __quarn_has rq create
end

# A control character, which the program shows by its number, is any character; so is a tab, which would end
# the name here. A name that begins as an option does gets a folder, which does not count.
function __quarn_members
    __quarn_members_of (__quarn_pick words (__quarn_others))[1]
end

function __quarn_members_of --argument-names archive
    set archive (string replace -r '^~/' $HOME/ -- "$archive")
    test -f "$archive"; or return
    set -l program (commandline -op)[1]
    command -q $program; or return
    command $program -t -- $archive 2>/dev/null </dev/null | string match -r . --entire \
        | string replace -ar '\\\\[01][0-7][0-7]|\t' '?' | string replace -r '^-' './-'
end

# The elements of a list that are there already, in front of each name.
function __quarn_list
    set -l done (commandline -ct | string replace -r '^--[a-z_]+=' '' | string match -r '^.*,')
    printf "$done%s\n" $argv
end

function __quarn_warnings
    __quarn_list L3910\t'older syntax of an option' L3920\t'a letter is repeated' \
        L6831\t'no such member, when deleting' L6874\t'builds of a module without a base' \
        L6875\t'a member is no object' L6876\t'builds of a module with several bases' \
        L6877\t'a difference of builds that no text can say' L6974\t'something in the archive is wrong'
end

function __quarn_all_warnings
    __quarn_warnings
    __quarn_list warning\t'all warnings'
end

set -g __quarn_ar_operations dmpqrstx
set -g __quarn_ar_modifiers abcCDfilNoPsSTuUvV
# Letters that not all operations know, each with those that do.
set -g __quarn_ar_restricted a:mr b:mr C:x i:mr N:dx o:x P:dmpqrst S:dmpqrtx T:x u:r

# The letters that quarn-ar has been given in front of the cursor.
function __quarn_ar_letters
    set -l letters
    for word in (__quarn_ar_words (commandline -opc)[2..])
        if string match -qr -- '^-[^-]' $word
            set letters "$letters"(string sub -s 2 -- $word)
        else if not string match -qr -- "[$__quarn_ar_operations]" "$letters"
            set letters "$letters$word"
        end
    end
    echo $letters
end

# Words without long options and their values.
function __quarn_ar_words
    set -l is_value no
    for word in $argv
        if test $is_value = yes
            set is_value no
        else if string match -qr -- '^--(libattrmap|plugin|target|rsp-quoting|diag_[a-z]+)$' $word
            set is_value yes
        else if not string match -q -- '--*' $word
            printf '%s\n' $word
        end
    end
end

# The operands of quarn-ar behind its letters; that at the cursor is empty.
function __quarn_ar_operands
    set -l letters
    for word in (__quarn_ar_words (__quarn_others))
        if string match -qr -- '^-.' $word
            set letters "$letters"(string sub -s 2 -- $word)
        else if test "$word" != ''; and not string match -qr -- "[$__quarn_ar_operations]" "$letters"
            set letters "$letters$word"
        else
            printf '%s\n' "$word"
        end
    end
end

# What the operand at the cursor is: letters, place, count, archive, file, member, or nothing.
function __quarn_ar_kind
    set -l letters (__quarn_ar_letters)
    if not string match -qr -- "[$__quarn_ar_operations]" "$letters"
        string match -q -- '--*' (commandline -ct); or echo letters
        return
    end
    set -l kinds
    string match -qr -- '[abi]' $letters; and set -a kinds place
    string match -q -- '*N*' $letters; and set -a kinds count
    set -a kinds archive
    string match -q -- '-*' (commandline -ct); and return
    set -l at (contains -i -- '' (__quarn_ar_operands)); or return
    if test $at -le (count $kinds)
        echo $kinds[$at]
    else if string match -qr -- '[rq]' $letters
        echo file
    else if string match -qr -- '[dmptx]' $letters
        echo member
    end
end

# The word of letters at the cursor, as it is and with each letter that may follow.
function __quarn_ar_offer_letters
    set -l current (commandline -ct)
    set -l operation (string match -r -- "[$__quarn_ar_operations]" "$current")
    if test -z "$operation"
        printf "$current%s\n" (string split '' $__quarn_ar_operations)
        return
    end
    printf '%s\n' $current
    for letter in (string split '' $__quarn_ar_modifiers)
        string match -q -- "*$letter*" $current; and continue
        set -l knows (string match -r -- "^$letter:.*" $__quarn_ar_restricted)
        test -z "$knows"; or string match -q -- "*:*$operation*" $knows; and printf '%s\n' $current$letter
    end
end

function __quarn_ar_members
    set -l letters (__quarn_ar_letters)
    set -l at 1
    string match -qr -- '[abi]' $letters; and set at (math $at + 1)
    string match -q -- '*N*' $letters; and set at (math $at + 1)
    set -l operands (__quarn_ar_operands)
    __quarn_members_of "$operands[$at]"
end

# Each name of the program loads this file.
complete -e -c quarn
complete -e -c quarn-ar
complete -e -c quarn-ranlib
complete -e -c quarn-json

complete -c quarn -f
complete -c quarn -n __quarn_wants_archive -a '(__fish_complete_suffix .a)'
complete -c quarn -n __quarn_wants_files -F
complete -c quarn -n __quarn_wants_members -a '(__quarn_members)' -d member

complete -c quarn -s a -x -a '(__quarn_members)' -d 'Insert or move after this member'
complete -c quarn -s b -x -a '(__quarn_members)' -d 'Insert or move before this member'
complete -c quarn -s C -d 'Do not overwrite files when extracting'
complete -c quarn -s c -d 'Do not tell of a new archive'
complete -c quarn -s d -d 'Delete members'
complete -c quarn -s h -d 'Show the help'
complete -c quarn -s i -x -a '(__quarn_members)' -d 'Insert or move before this member'
complete -c quarn -s m -d 'Move members'
complete -c quarn -s n -d 'Write no symbol table'
complete -c quarn -s p -d 'Print members'
complete -c quarn -s q -d 'Insert files'
complete -c quarn -s r -d 'Insert files'
complete -c quarn -s s -d 'Make the symbol table anew'
complete -c quarn -s T -d 'Cut names that are too long for files'
complete -c quarn -s t -d 'List members'
complete -c quarn -s u -d 'Replace only what is not newer'
complete -c quarn -s V -d 'Show the version'
complete -c quarn -s v -d 'Tell of each member'
complete -c quarn -s x -d 'Extract members'
complete -c quarn -l create -d 'Make a new archive of files'
complete -c quarn -l db_check -x -a 'none low medium high extravagant show' -d 'Choose how much the program checks itself'
complete -c quarn -l debug_symbols -d 'Publish symbols of debug sections'
complete -c quarn -l diag_error -x -a '(__quarn_all_warnings)' -d 'Make errors of warnings'
complete -c quarn -l diag_remark -x -a '(__quarn_warnings)' -d 'Make remarks of warnings'
complete -c quarn -l diag_style -x -a 'zev\t"Severity, code and text" gnu\t"For editors" ide\t"For development environments" devstudio\t"As ide" list\t"Show these names"' -d 'Choose the form of diagnostics'
complete -c quarn -l diag_suppress -x -a '(__quarn_all_warnings)' -d 'Say nothing of warnings'
complete -c quarn -l diag_warning -x -a '(__quarn_all_warnings)' -d 'Make warnings of warnings again'
complete -c quarn -l entries -d 'List entry points'
complete -c quarn -l help -d 'Show the help'
complete -c quarn -l libattrmap -r -F -d 'Take attributes from a map of library names'
complete -c quarn -l message_locale -x -a 'en_US ja_JP en_US.UTF-8 ja_JP.UTF-8 UTF-8' -d 'Choose the language'
complete -c quarn -l new_files_only -d 'Replace only what is older'
complete -c quarn -l no_debug_symbols -d 'Leave out symbols of debug sections'
complete -c quarn -l no_normalise -x -d 'Give new members this time and no owner'
complete -c quarn -l no_qobix_buildattr -d 'Take attributes from decoration symbols'
complete -c quarn -l no_unique_symbols -d 'Publish each definition of a symbol'
complete -c quarn -l normalise -x -d 'Give new members this time and no owner'
complete -c quarn -l qobix_buildattr -d 'Take attributes from attribute sections too'
complete -c quarn -l show_cmdline -d 'Show the command line as it is understood'
complete -c quarn -l sizes -d 'Show the sizes of objects'
complete -c quarn -l unique_symbols -d 'Publish the first definition of a symbol'
complete -c quarn -l version -d 'Show the version'
complete -c quarn -l version_number -d 'Show the version as a number'
complete -c quarn -l via -r -F -d 'Read further words from a file'
complete -c quarn -l vsn -d 'Show the version'
complete -c quarn -l zs -d 'Show the symbol table'
complete -c quarn -l zt -d 'Show sizes and entry points'

complete -c quarn-ar -f
complete -c quarn-ar -n 'contains (__quarn_ar_kind) letters' -a '(__quarn_ar_offer_letters)'
complete -c quarn-ar -n 'contains (__quarn_ar_kind) place member' -a '(__quarn_ar_members)' -d member
complete -c quarn-ar -n 'contains (__quarn_ar_kind) archive' -a '(__fish_complete_suffix .a)'
complete -c quarn-ar -n 'contains (__quarn_ar_kind) file' -F
complete -c quarn-ranlib -f -a '(__fish_complete_suffix .a)'
complete -c quarn-ranlib -s D -d 'Nothing, for compatibility'
complete -c quarn-ranlib -s t -d 'Make the table anew all the same'
complete -c quarn-ranlib -s U -d 'Nothing, for compatibility'
complete -c quarn-ranlib -s v -d 'Show the version'
for name in quarn-ar quarn-ranlib
    complete -c $name -s h -d 'Show the help'
    complete -c $name -s V -d 'Show the version'
    complete -c $name -l diag_error -x -a '(__quarn_all_warnings)' -d 'Make errors of warnings'
    complete -c $name -l diag_remark -x -a '(__quarn_warnings)' -d 'Make remarks of warnings'
    complete -c $name -l diag_style -x -a 'zev gnu ide devstudio list' -d 'Choose the form of diagnostics'
    complete -c $name -l diag_suppress -x -a '(__quarn_all_warnings)' -d 'Say nothing of warnings'
    complete -c $name -l diag_warning -x -a '(__quarn_all_warnings)' -d 'Make warnings of warnings again'
    complete -c $name -l help -d 'Show the help'
    complete -c $name -l libattrmap -r -F -d 'Take attributes from a map of library names'
    complete -c $name -l plugin -r -F -d 'Nothing, for compatibility'
    complete -c $name -l qobix_buildattr -d 'Take attributes from attribute sections too'
    complete -c $name -l rsp-quoting -x -a 'posix windows' -d 'How response files quote'
    complete -c $name -l target -x -a 'default binary' -d 'The format of archives'
    complete -c $name -l version -d 'Show the version'
end

complete -c quarn-json -f -a '(__fish_complete_suffix .a)'
complete -c quarn-json -l help -d 'Show the help'
complete -c quarn-json -l libattrmap -r -F -d 'Take attributes from a map of library names'
complete -c quarn-json -l qobix_buildattr -d 'Take attributes from attribute sections too'
complete -c quarn-json -l version -d 'Show the version'
