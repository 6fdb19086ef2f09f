#!/bin/bash
# Writes the manual page of zonmedia from what its commands say for --help.
#   usage: make-manual.sh PROGRAM VERSION >zonmedia.1
set -euo pipefail
program=$1 version=$2
export COLUMNS=73   # of 80, as pages are shown, after the indent of a section

# Lines as they stand, with what the page's language would read as its own.
verbatim() { sed -e 's/\\/\\e/g' -e 's/-/\\-/g' -e "s/^[.']/\\\\\&&/"; }
subcommands() { "$program" "$@" --help | sed -n '/^Subcommands:/,/^$/s/^  \([a-z][a-z-]*\) .*/\1/p'; }

# section COMMAND... describes a command and the commands below it.
section()
{
	local name
	printf '.SS "%s"\n.nf\n' "$*"
	"$program" "$@" --help | verbatim
	printf '.fi\n'
	for name in $(subcommands "$@"); do
		section "$@" "$name"
	done
}

cat <<END
.TH ZONMEDIA 1 "" "zonmedia $version" "User Commands"
.SH NAME
zonmedia \- times, rates, channels and pixel formats of media files
.SH SYNOPSIS
.B zonmedia
.I COMMAND
[\fIOPTION\fR]... [\fIARGUMENT\fR]...
.SH DESCRIPTION
.nf
END
"$program" --help | verbatim
printf '.fi\n.SH COMMANDS\n'
for name in $(subcommands); do
	section "$name"
done
