# Completion of zonmedia for bash. The program's own --help names the commands and options.

_zonmedia()
{
	local program=${COMP_WORDS[0]} current=${COMP_WORDS[COMP_CWORD]} word
	local previous=${COMP_WORDS[COMP_CWORD-1]}
	local -a command=() words=("${COMP_WORDS[@]:1:COMP_CWORD-1}")
	if [[ ${words[0]-} == --language ]]; then
		words=("${words[@]:2}")
	fi
	for word in "${words[@]}"; do
		[[ $word =~ ^[a-z]+$ ]] || break
		command+=("$word")
		((${#command[@]} < 2)) || break
	done

	local help names values
	[[ $previous != --language ]] || command=()
	help=$(COLUMNS=10000 "$program" "${command[@]}" --help 2>/dev/null) || return
	if [[ $previous == --* ]] && values=$(sed -n "s/^  $previous .*one of: \([^;]*\).*/\1/p" <<<"$help") && [[ $values ]]; then
		names=${values//, / }
	elif [[ $current == -* ]]; then
		names=$(sed -n 's/^  \(-[^ ]*\).*/\1/p' <<<"$help" | tr ',' '\n')
	else
		names=$(sed -n '/^Subcommands:/,/^$/s/^  \([a-z][a-z-]*\) .*/\1/p' <<<"$help")
	fi
	mapfile -t COMPREPLY < <(compgen -W "$names" -- "$current")
}

# Without a name that fits, file names are offered.
complete -o default -F _zonmedia zonmedia
