#!/bin/sh
# Makes small video files in fields, upper or lower first, and progressive ones: each codec that interlaces, in each
# container that takes it. judged.txt says for each file what a filter that looks at nothing but the pictures makes of it.
#   usage: make-fields.sh FOLDER      needs Debian's ffmpeg
set -eu
folder=${1:?usage: make-fields.sh FOLDER}
mkdir -p "$folder"
cd "$folder"

run() { ffmpeg -nostdin -hide_banner -loglevel error -y "$@"; }
moving() { echo "smptebars=size=$1:rate=50,scroll=horizontal=0.02"; }

# A line a codec: its name, the number of its source below, its containers, its format, its options
codecs='
prores_ks  0 mov,mkv,avi        yuv422p10le -qscale:v 31
prores_aw  0 mxf                yuv422p10le -qscale:v 31
v210       0 mov,mkv,avi        yuv422p10le
rawvideo   0 mov,mkv            uyvy422
ffv1       0 mov,mkv,avi        yuv420p -level 3
mpeg2video 0 mov,mkv,mxf,ts,avi yuv420p -q:v 20
mpeg4      0 mov,mkv,avi        yuv420p -q:v 20
libx264    0 mov,mkv,mxf,ts,avi yuv420p -bf 0
huffyuv    0 mov,mkv            yuv422p
dvvideo    1 mov,mkv,mxf,avi,dv yuv420p
dnxhd      2 mov,mkv,mxf        yuv422p -b:v 120M
'

# make ORDER WEAVE FIELD [OPTION...]: the files of one order, CODEC-ORDER.CONTAINER; fields are woven of two pictures each.
make() {
	order=$1 weave=$2 field=$3
	shift 3
	outputs=$(echo "$codecs" | while read -r codec source containers format options; do
		for container in $(echo "$containers" | tr ',' ' '); do
			echo "-map $source -vf $weave,format=$format,setfield=$field $* -c:v $codec $options -frames:v 3"
			echo "$codec-$order.$container"
		done
	done)
	# shellcheck disable=SC2086
	run -f lavfi -i "$(moving 96x64)" -f lavfi -i "$(moving 720x576)" -f lavfi -i "$(moving 1920x1080)" $outputs
}
make upper tinterlace=interleave_top tff -flags +ilme+ildct
make lower tinterlace=interleave_bottom bff -flags +ilme+ildct
make progressive framestep=2 prog
rm dvvideo-progressive.*   # whose pictures this encoder calls fields, too

# The containers above say that the lines of both fields lie interleaved; these say that one field lies behind the other.
for order in upper lower; do
	top=$([ $order = upper ] && echo 1 || echo 0)
	run -i huffyuv-$order.mov -flags +ilme -top "$top" -c:v huffyuv stored-$order.mov \
		-flags +ilme -top "$top" -c:v huffyuv stored-$order.mkv
done

number=0 inputs='' filters='' outputs=''
for file in *-*.*; do
	inputs="$inputs -i $file"
	filters="$filters[$number:v]idet,metadata=mode=print:key=lavfi.idet.multiple.current_frame:file=$file.idet[$number];"
	outputs="$outputs -map [$number]"
	number=$((number + 1))
done
# shellcheck disable=SC2086
run $inputs -filter_complex "${filters%;}" $outputs -f null -
for file in *.idet; do
	echo "${file%.idet} $(sed -n '$s/.*=//p' "$file")"
done > judged.txt
