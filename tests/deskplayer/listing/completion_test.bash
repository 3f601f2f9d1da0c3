#!/usr/bin/env bash
# Tests the bash completion and the manual page of the desk player.
#
#   completion_test.bash TEST COMPLETION PAGE PROGRAM SOURCES
#
# TEST is one of the functions below that begin with a capital letter.
set -u

completion=$2
page=$3
program=$4
sources=$5

. "$completion"

folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
mkdir -p "$folder/disc/BDMV/PLAYLIST" "$folder/a disc/BDMV/PLAYLIST" "$folder/documents"
touch "$folder"/disc/BDMV/PLAYLIST/{00000,00008,00080,00800,12345}.mpls \
    "$folder"/disc/BDMV/PLAYLIST/{1,000001}.mpls "$folder/disc/BDMV/PLAYLIST/00002.txt" \
    "$folder/a disc/BDMV/PLAYLIST/00007.mpls" \
    "$folder"/{evening.session,evening.json,notes.txt}
cd "$folder" || exit 1

# The real compopt works only during a completion.
compopt() { readline_options+=("$2"); }

# complete_words WORD...: completes the last of the words after the program.
complete_words() {
    COMP_WORDS=(bdmv-deskplayer "$@")
    COMP_CWORD=$#
    readline_options=()
    _bdmv_deskplayer
}

# expect OFFERED WORD...: completing the last of the words must offer OFFERED, in any order.
expect() {
    local expected=$1
    shift
    complete_words "$@"
    local offered
    offered=$(printf '%s\n' "${COMPREPLY[@]}" | LC_ALL=C sort | xargs)
    [ "$offered" = "$expected" ] && return
    printf 'bdmv-deskplayer %s\n  offers  %s\n  but not %s\n' "$*" "$offered" "$expected"
    exit 1
}

# same WHAT ONE OTHER: two lists of lines must be equal.
same() {
    [ -n "$2" ] && [ "$2" = "$3" ] && return
    printf '%s\n' "$1 differ:"
    diff <(printf '%s\n' "$2") <(printf '%s\n' "$3")
    exit 1
}

sorted() { tr -s ' \n' '\n' | LC_ALL=C sort; }

OffersOptions() {
    expect '--list --listen --log --log-prefix' --l
    expect '--session --strict --summary' disc --s
    expect '--remote' --playlist 1 disc --rem
}

OffersPlayListsOfTheDiscOnTheCommandLine() {
    expect '0 12345 8 80 800' disc --playlist ''
    expect '8 80 800' disc --playlist 8
    expect '0 12345 8 80 800' disc/ --describe ''
    expect '0 12345 8 80 800' disc/BDMV --describe ''
    expect '0 12345 8 80 800' --format json disc --describe ''
    expect '8 80 800' disc --playlist = 8
    expect '0 12345 8 80 800' --format = json disc --playlist =
}

OffersPlayListsOfADiscWithABlankInItsName() {
    expect '7' 'a\ disc' --playlist ''
    expect '7' '"a disc"' --playlist ''
}

OffersPlayListsWhateverTheCaseOfNames() {
    mkdir -p "$folder/documents/bdmv/playlist"
    touch "$folder/documents/bdmv/playlist/00009.MPLS"
    expect '9' documents --playlist ''
    expect '9' documents/bdmv --playlist ''
}

OffersPlayListsOfADiscInTheHomeFolder() {
    HOME=$folder expect '0 12345 8 80 800' '~/disc' --playlist ''
}

OffersNoPlayListsWithoutADisc() {
    expect '' --playlist ''
    expect '' --format disc --playlist ''
    expect '' documents --playlist ''
    expect '' missing --playlist ''
}

ExecutesNothingFromTheCommandLine() {
    for word in '$(touch run)' '`touch run`' '"$(touch run)"' 'a[$(touch run)]'; do
        for option in --playlist --describe --session --replay --field-log --format --output \
            --output-folder --jobs --tag --compare --page --listen --only --log --log-prefix --l; do
            complete_words "$word" $option ''
            complete_words $option "$word"
            complete_words $option "PlayItem,$word"
            complete_words $option "$word,PlayItem"
            complete_words "$word" "$word"
        done
    done
    [ ! -e run ]
}

OffersFormats() {
    expect 'html json text trace' --format ''
    expect 'text trace' disc --format t
    expect 'json' disc --format = j
}

OffersInterfaces() {
    expect 'button control interactive settings' --listen ''
    expect 'control' --listen c
    expect 'control,button' --listen control,b
    expect 'control,settings,button control,settings,interactive' --listen control,settings,
}

OffersCallbacks() {
    expect 'PlayFailed PlayItem PlayMode PlayStarted Playlist' --only Play
    expect '' --only 'Play[IMS]'
}

OffersCallbacksOfAList() {
    expect 'PlayItem,PlayFailed PlayItem,PlayMode PlayItem,PlayStarted PlayItem,Playlist' \
        --only PlayItem,Play
}

OffersEveryCallback() {
    complete_words --only ''
    same 'offered and declared callbacks' \
        "$(printf '%s\n' "${COMPREPLY[@]}" | sorted)" \
        "$(sed -n 's/^ *virtual void \([A-Za-z]*\)(.*/\1/p' \
            "$sources"/bdmv/inc/bdmvnavigator/inav*listener.h | sorted)"
}

OffersSessionsAndFolders() {
    expect 'a disc disc documents evening.session' --session ''
    expect 'evening.session' disc --session e
    [[ ${readline_options[*]} == filenames ]]
}

OffersAnyFileForARecording() {
    expect 'evening.json evening.session' --replay e
    expect '0 12345 8 80 800' --replay evening.json disc --describe ''
}

OffersAnyFileForEachFieldLog() {
    expect 'evening.json evening.session' --field-log e
    expect 'evening.json evening.session' --field-log evening.json e
    [[ ${readline_options[*]} == filenames ]] || exit 1
    expect 'evening.json evening.session' --field-log evening.json notes.txt e
    expect 'evening.json evening.session' --field-log = evening.json e
    expect 'notes.txt' --format json --field-log - n
    expect '--format' --field-log evening.json --fo
    expect '' --field-log evening.json --log-prefix e
    expect 'disc documents' --list d
}

OffersAnyFileForAPage() {
    expect 'evening.json evening.session' --compare e
    expect 'evening.json evening.session' --page e
    expect '0 12345 8 80 800' --compare evening.json --page notes.txt disc --describe ''
}

OffersAnyFileForTheOutput() {
    expect 'evening.json evening.session' disc --output e
}

OffersFoldersForOutputs() {
    expect 'a disc disc documents' --field-log player.log --output-folder ''
    [[ ${readline_options[*]} == filenames ]]
}

OffersFoldersForTheDisc() {
    expect 'disc documents' d
    expect 'a disc disc documents' --list ''
    expect 'disc/BDMV' disc/
    [[ ${readline_options[*]} == filenames ]]
}

OffersNothingAfterTheDisc() {
    expect '' disc ''
    expect '' --playlist 1 disc d
}

OffersNothingForTheLog() {
    expect '' --log ''
    expect '' --log e
    expect '' --field-log player.log --log-prefix ''
}

OffersNothingForJobsAndTags() {
    expect '' --field-log player.log --jobs ''
    expect '' --tag ''
    expect '0 12345 8 80 800' --tag device=7 disc --describe ''
}

KeepsCompletingTheSameWordInAList() {
    complete_words --only ''
    [[ ${readline_options[*]} == nospace ]] || exit 1
    complete_words --listen control,
    [[ ${readline_options[*]} == nospace ]]
}

options_of_help() { "$program" --help | sed -n 's/^  \(-.,\)*--\([a-z-]*\) .*/--\2/p' | sorted; }

CompletesTheOptionsOfTheProgram() {
    same 'options of completion and program' \
        "$(sorted <<<"$_bdmv_deskplayer_options")" "$(options_of_help)"
}

PageHasTheOptionsOfTheProgram() {
    same 'options of page and program' \
        "$(sed -n 's/^\.It Fl -\([a-z-]*\).*/--\1/p' "$page" | sorted)" "$(options_of_help)"
}

PageHasTheCommandsOfTheProgram() {
    same 'commands of page and program' \
        "$(sed -n '/^\.Sh SESSIONS/,/^\.Sh KEYS/s/^\.It Ic //p' "$page" | sed 's/ Ar / /')" \
        "$("$program" --commands | cut -c -38 | sed 's/ *$//')"
}

PageHasTheKeysOfTheProgram() {
    same 'keys of page and program' \
        "$(sed -n '/^\.Sh KEYS/,/^\.Sh /s/^\.It Ic \(\\&\)*//p' "$page" | sorted)" \
        "$({
            sed -n "s/^ *{'\\(.\\)', \".*/\\1/p" "$sources/deskplayer/session/remote.cpp" |
                sed 's/^ $/space/'
            printf '%s\n' '?' q
        } | sorted)"
}

PageIsWellFormed() {
    if ! type mandoc >/dev/null 2>&1; then
        echo 'mandoc is not installed'
        exit 77
    fi
    mandoc -T lint -W warning "$page"
}

"$1"
