#!/bin/bash
# One way of adopting the library, from outside: builds the program next to this script against it and runs that.
#   usage: adopt.sh WAY SOURCE BUILD SCRATCH
# SOURCE and BUILD are the library's; what is made in SCRATCH stays there, so that a second run has little to do.
set -euo pipefail
way=$1 source=$2 build=$3 scratch=$4
here=$(cd "$(dirname "$0")" && pwd)
mkdir -p "$scratch"

# adopt NAME CMAKE-OPTION...
adopt()
{
	local folder=$scratch/$1
	shift
	cmake -S "$here" -B "$folder" -G Ninja -DCMAKE_BUILD_TYPE=Debug "$@"
	cmake --build "$folder"
	"$folder/adopter"
}

# compile_by_pkg_config KIND PROGRAM SOURCE-FILE PKG-CONFIG-OPTION...
compile_by_pkg_config()
{
	local prefix=$scratch/installed-$1 program=$scratch/$2 file=$3
	shift 3
	local flags
	read -ra flags <<<"$(PKG_CONFIG_PATH=$prefix/lib/pkgconfig pkg-config "$@" --cflags --libs 'zonmediatypes >= 1')"
	"${CXX:-c++}" -std=c++20 "$file" -o "$program" "${flags[@]}"
	LD_LIBRARY_PATH=$prefix/lib "$program"
}

# The program of the README, which states its own output in its last comment.
run_readme_program()
{
	sed -n '/^```cpp$/,/^```$/{/^```/!p}' "$source/README.md" >"$scratch/readme.cpp"
	local said stated
	said=$(compile_by_pkg_config shared readme "$scratch/readme.cpp")
	stated=$(sed -n 's|.*// *||p' "$scratch/readme.cpp" | tail -n 1)
	[ "$said" = "$stated" ] || { echo "the README's program says '$said', and the README '$stated'" >&2; exit 1; }
}

# The sheet of the README is the beginning of what the companion says, which is installed beside the libraries.
check_readme_sheet()
{
	sed -n '/^```text$/,/^```$/{/^```/!p}' "$source/README.md" >"$scratch/readme-sheet.txt"
	(cd "$source" && "$scratch/installed-shared/bin/zonmedia" sheet examples/media/hour-change.mov) |
		head -n "$(wc -l <"$scratch/readme-sheet.txt")" | diff "$scratch/readme-sheet.txt" -
}

# Installed with the companion: a page for man, which has every command, and the completion of its words.
check_companion()
{
	grep -q '^Usage: zonmedia audio matrix' "$scratch/installed-shared/share/man/man1/zonmedia.1"
	# shellcheck disable=SC1091
	source "$scratch/installed-shared/share/bash-completion/completions/zonmedia"
	complete_words zonmedia audio ma
	[[ " ${COMPREPLY[*]} " == *" matrix "* && " ${COMPREPLY[*]} " != *" layout "* ]]
	complete_words zonmedia --language de audio ma
	[[ " ${COMPREPLY[*]} " == *" matrix "* ]]
	complete_words zonmedia time --to
	[[ " ${COMPREPLY[*]} " == *" --to-rate "* ]]
}

complete_words()
{
	COMP_WORDS=("$scratch/installed-shared/bin/$1" "${@:2}")
	COMP_CWORD=$(($# - 1))
	_zonmedia
}

# none WHAT COMMAND... fails when the command, run in the installation, prints anything.
none()
{
	local what=$1 found
	shift
	found=$(cd "$scratch/installed-shared" && "$@" || true)
	[ -z "$found" ] || { printf 'installed, and should not be: %s\n%s\n' "$what" "$found" >&2; exit 1; }
}

# Every exported name belongs to a namespace of the library's, or to the facets of 16-bit streams.
foreign_exports()
{
	nm --dynamic --demangle --defined-only lib/lib*.so | grep '^[0-9a-f]' | cut -c 20- | grep -vE \
		'^((typeinfo|typeinfo name|vtable|guard variable) for )?(zoncore::|zonmediatypes::|std::(ctype|__cxx11::numpunct|num_get|num_put)<unsigned short)'
}

# The Debian packages, made by somebody with a strict umask: they hold what is installed and nothing else, open to
# everybody, and depend on each other and on what they are linked with. The companion runs from what was packed.
check_packages()
{
	local folder=$scratch/packages package
	rm -rf "$folder"
	(umask 077 && cpack --config "$build/CPackConfig.cmake" -B "$folder")
	for package in "$folder"/*.deb; do
		dpkg-deb --extract "$package" "$folder/root"
		dpkg-deb --contents "$package"
	done >"$folder/contents"
	diff <(cd "$scratch/installed-shared" && find . ! -type d | sort) <(cd "$folder/root/usr" && find . ! -type d | sort)
	if grep -vE '^((drwxr-xr-x|-rw-r--r--|lrwxrwxrwx) root/root|-rwxr-xr-x root/root .* \./usr/bin/)' "$folder/contents"; then
		echo "packed with the permissions above" >&2
		exit 1
	fi
	depends "$folder"/libzonmediatypes[0-9]*.deb 'libstdc\+\+6 '
	depends "$folder"/libzonmediatypes-dev_*.deb 'libzonmediatypes[0-9]+ \(= .*libboost-dev'
	[ ! -e "$folder/root/usr/bin/zonmedia" ] || {
		depends "$folder"/zonmedia_*.deb 'libzonmediatypes[0-9]+ \(= .*libavformat'
		"$folder/root/usr/bin/zonmedia" --version
	}
}

depends() { dpkg-deb --field "$1" Depends | grep -E "$2" || { echo "$1 does not depend on $2" >&2; exit 1; }; }

case $way in
	install)
		cmake --install "$build" --prefix "$scratch/installed-shared"
		none "internal headers" find include -path '*/src/*'
		none "names of this build's folders" grep -rl -e "$source" -e "$build" include lib/cmake lib/pkgconfig
		none "exports beside the interface" foreign_exports
		;;
	find_package-shared)
		adopt find_package-shared -DADOPT_BY=find_package -DCMAKE_PREFIX_PATH="$scratch/installed-shared"
		;;
	FetchContent-static)
		adopt FetchContent -DADOPT_BY=FetchContent -DADOPT_SOURCE="$source" -DBUILD_SHARED_LIBS=OFF -DZON_INSTALL=ON
		cmake --install "$scratch/FetchContent" --prefix "$scratch/installed-static"
		;;
	find_package-static)
		adopt find_package-static -DADOPT_BY=find_package -DADOPT_COMPONENTS=static \
			-DCMAKE_PREFIX_PATH="$scratch/installed-static"
		;;
	pkg-config-shared) compile_by_pkg_config shared pkg-config-shared "$here/Adopter.cpp" ;;
	pkg-config-static) compile_by_pkg_config static pkg-config-static "$here/Adopter.cpp" --static ;;
	readme)
		run_readme_program
		[ ! -e "$scratch/installed-shared/bin/zonmedia" ] || check_readme_sheet
		;;
	companion) check_companion ;;
	packages) check_packages ;;
	translations)
		text=$("$scratch/installed-shared/bin/zonmedia" --language de time 1 --rate 25 --display frames)
		[[ $text == *24-fps-Timecode* ]] || { echo "the installed companion speaks no German" >&2; exit 1; }
		;;
	*) echo "adopt.sh: no way is called '$way'" >&2; exit 2 ;;
esac
