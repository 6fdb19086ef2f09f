#!/bin/sh
# Makes one small video file of each kind that the library has a format or a pixel shape for, as other software writes it.
#   usage: make-video.sh FOLDER      needs Debian's ffmpeg
set -eu
folder=${1:?usage: make-video.sh FOLDER}
mkdir -p "$folder"
cd "$folder"

make() { ffmpeg -nostdin -hide_banner -loglevel error -y -f lavfi "$@"; }
picture() { echo "testsrc=size=$1:rate=$2"; }
plain() { echo "color=c=gray:size=$1:rate=$2"; }

# DV: dv SIZE RATE CHROMA FILE [OPTION...]
dv() {
	source=$(picture "$1" "$2"); chroma=$3; file=$4
	shift 4
	make -i "$source" -frames:v 1 -pix_fmt "$chroma" -c:v dvvideo "$@" "$file"
}
dv 720x480 30000/1001 yuv411p dv25-ntsc.dv
dv 720x480 30000/1001 yuv411p dv25-ntsc-wide.dv -aspect 16:9
dv 720x576 25 yuv420p dv25-pal.dv
dv 720x576 25 yuv411p dv25-pal-dvcpro.mov
dv 720x480 30000/1001 yuv422p dv50-ntsc.dv
dv 720x576 25 yuv422p dv50-pal.dv
dv 960x720 60000/1001 yuv422p dv100-720p60.mov
dv 960x720 50 yuv422p dv100-720p50.mov
dv 1280x1080 30000/1001 yuv422p dv100-1080i60.mov
dv 1440x1080 25 yuv422p dv100-1080i50.mov

# MPEG-2: mpeg2 SIZE RATE FILE OPTION...
mpeg2() {
	source=$(plain "$1" "$2"); file=$3
	shift 3
	make -i "$source" -frames:v 2 -pix_fmt yuv420p -c:v mpeg2video -q:v 31 "$@" -f mpeg2video "$file"
}
mpeg2 720x480 30000/1001 mpeg2-upper-601.m2v -vf setsar=8/9 -flags +ilme+ildct -top 1 -colorspace smpte170m
mpeg2 720x576 25 mpeg2-lower.m2v -vf setsar=16/15 -flags +ilme+ildct -top 0
mpeg2 1440x1080 25 mpeg2-upper-709.m2v -vf setsar=4/3 -flags +ilme+ildct -top 1 -colorspace bt709
mpeg2 1280x720 50 mpeg2-progressive.m2v

# MPEG-4 part 2, with the pixel shapes of its table: mpeg4 SIZE RATE SHAPE FILE
mpeg4() { make -i "$(plain "$1" "$2")" -frames:v 1 -vf "setsar=$3" -pix_fmt yuv420p -c:v mpeg4 -q:v 31 "$4"; }
mpeg4 720x576 25 12/11 mpeg4-12-11.mp4
mpeg4 720x480 30000/1001 10/11 mpeg4-10-11.mp4
mpeg4 720x480 30000/1001 40/33 mpeg4-40-33.mp4

# Uncompressed: raw FORMAT CODEC FILE
raw() { make -i "$(picture 48x32 25)" -frames:v 1 -pix_fmt "$1" -c:v "$2" "$3"; }
raw uyvy422 rawvideo uyvy.mov
raw yuyv422 rawvideo yuyv.mov
raw bgra rawvideo bgra.avi
raw bgr0 rawvideo bgr0.nut
raw argb rawvideo argb.mov
raw 0rgb rawvideo 0rgb.nut
raw yuv422p10le v210 v210.mov
raw gbrp10 r210 r210.mov
raw rgb24 rawvideo rgb24.mov
