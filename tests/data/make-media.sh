#!/bin/sh
# Makes small media files of many kinds, for tests against what other software writes.
#   usage: make-media.sh FOLDER      needs Debian's ffmpeg
set -eu
folder=${1:?usage: make-media.sh FOLDER}
mkdir -p "$folder"
cd "$folder"

make() { ffmpeg -nostdin -hide_banner -loglevel error -y "$@"; }
picture() { echo "testsrc=size=$1:rate=$2"; }
plain() { echo "color=c=gray:size=$1:rate=$2"; }

# Tones in so many channels of a layout: channels LAYOUT SECONDS
tones() {
	expressions=$(seq 1 "$1" | sed 's/.*/0.2*sin(2*PI*t*&00)/' | paste -sd '|')
	echo "aevalsrc=exprs=$expressions:s=48000:c=$2:d=$3"
}

# DV, whose frame size is fixed by its variant
make -f lavfi -i "$(picture 720x480 30000/1001)" -frames:v 1 -vf setsar=8/9 -pix_fmt yuv411p -c:v dvvideo -f dv dv25-ntsc.dv
make -f lavfi -i "$(picture 720x576 25)" -frames:v 1 -vf setsar=16/15 -pix_fmt yuv420p -c:v dvvideo -f dv dv25-pal.dv
make -f lavfi -i "$(picture 720x480 30000/1001)" -frames:v 1 -pix_fmt yuv422p -c:v dvvideo -f dv dv50-ntsc.dv
make -f lavfi -i "$(picture 720x576 25)" -frames:v 1 -pix_fmt yuv422p -c:v dvvideo -f dv dv50-pal.dv
make -f lavfi -i "$(picture 960x720 60000/1001)" -frames:v 1 -pix_fmt yuv422p -c:v dvvideo dv100-720p60.mov
make -f lavfi -i "$(picture 1280x1080 30000/1001)" -frames:v 1 -pix_fmt yuv422p -c:v dvvideo dv100-1080i60.mov
make -f lavfi -i "$(picture 1440x1080 25)" -frames:v 1 -pix_fmt yuv422p -c:v dvvideo dv100-1080i50.mov

# MPEG, interlaced, as bare streams that state no length
make -f lavfi -i "$(plain 720x576 25)" -frames:v 3 -vf setsar=16/15 -pix_fmt yuv420p -c:v mpeg2video \
	-flags +ilme+ildct -top 0 -q:v 31 -f mpeg2video mpeg2-pal.m2v
make -f lavfi -i "$(plain 1440x1080 25)" -frames:v 2 -vf setsar=4/3 -pix_fmt yuv420p -c:v mpeg2video \
	-flags +ilme+ildct -top 1 -q:v 31 -colorspace bt709 -color_primaries bt709 -color_trc bt709 -f mpeg2video mpeg2-709.m2v

# Timecode tracks
make -f lavfi -i "$(picture 48x32 30000/1001)" -frames:v 2 -pix_fmt yuv422p10le -c:v v210 -timecode '01:00:00;00' v210-drop.mov
make -f lavfi -i "$(picture 50x32 24000/1001)" -frames:v 2 -pix_fmt yuv422p10le -c:v v210 -timecode '01:00:00:00' v210-non-drop.mov
make -f lavfi -i "$(plain 64x48 60000/1001)" -frames:v 8 -c:v mpeg4 -q:v 31 -timecode '23:59:59;58' over-midnight.mov

# Packed pictures
make -f lavfi -i "$(picture 48x32 25)" -frames:v 1 -pix_fmt uyvy422 -c:v rawvideo uyvy.mov
make -f lavfi -i "$(picture 48x32 25)" -frames:v 1 -pix_fmt yuyv422 -c:v rawvideo yuyv.mov
make -f lavfi -i "$(picture 48x32 25)" -frames:v 1 -pix_fmt bgra -c:v rawvideo bgra.avi
make -f lavfi -i "$(picture 48x32 25)" -frames:v 1 -pix_fmt argb -c:v rawvideo argb.mov

# A codec that the library has no pixel format for
make -f lavfi -i "$(plain 64x48 25)" -frames:v 2 -pix_fmt yuv420p -c:v libx264 h264.mp4

# Rates: one that is written with two decimals, and one without a display of its own
make -f lavfi -i "$(plain 64x48 2997/100)" -frames:v 1000 -c:v mpeg4 -q:v 31 inexact.avi
make -f lavfi -i "$(plain 64x48 15)" -frames:v 15 -c:v mpeg4 -q:v 31 fifteen.mp4

# Sound
make -f lavfi -i "$(tones 1 mono 0.01)" -c:a pcm_s16le mono.wav
make -f lavfi -i "$(tones 2 stereo 0.01)" -c:a pcm_s16le stereo.wav
make -f lavfi -i "$(tones 6 5.1 0.01)" -c:a pcm_s16le 5.1-back.wav
make -f lavfi -i "$(tones 6 '5.1(side)' 0.01)" -c:a pcm_s16le 5.1-side.wav
make -f lavfi -i "$(tones 8 7.1 0.01)" -c:a pcm_s24le 7.1.wav
make -f lavfi -i "$(tones 6 5.1 0.05)" -c:a aac -b:a 128k 5.1.m4a
make -f lavfi -i "$(tones 2 stereo 1)" -c:a aac -b:a 64k -f adts stereo.aac
make -f lavfi -i "$(tones 1 mono 0.01)" -c:a pcm_s24le -write_bext 1 -metadata time_reference=1728000000 ten-hours.wav

# Lengths: two seconds of picture beside more sound; a clip whose frames are 1/25 s and then 15/25 s apart
short="$(plain 64x48 25),trim=duration=2"
make -f lavfi -i "$short" -f lavfi -i "$(tones 1 mono 10)" -c:v mpeg4 -c:a pcm_s16le short-picture.mkv
make -itsoffset 5 -f lavfi -i "$short" -f lavfi -i "$(tones 1 mono 1)" -c:v mpeg4 -c:a pcm_s16le late-picture.mkv
make -f lavfi -i "$short" -f lavfi -i "$(tones 1 mono 3)" -c:v mpeg2video -c:a mp2 -muxrate 60M short-picture.ts
make -f lavfi -i "$short" -c:v mpeg2video short.mpg
make -f lavfi -i "$short" -c:v libx264 -g 10 short.mp4
make -ss 0.6 -i short.mp4 -c copy edited.mp4
make -f lavfi -i "$(picture 64x48 25),trim=duration=20" -vf "select='lt(n,30)+not(mod(n,15))'" -vsync vfr -c:v libx264 uneven.mp4
make -i uneven.mp4 -c copy uneven.mkv
make -i uneven.mp4 -c copy -metadata:s:v NUMBER_OF_FRAMES=62 counted.mkv
make -f lavfi -i "$short" -c:v rawvideo -pix_fmt uyvy422 raw.avi

# Files that are too large to be read whole, by what players skip; and files whose end is missing
for file in short-picture.mkv late-picture.mkv edited.mp4 uneven.mkv uneven.mp4 counted.mkv; do
	cp "$file" "large-$file"
	truncate -s 20M "large-$file"
done
cut_to() { head -c $(($(wc -c < "$2") * $1 / 100)) "$2" > "cut-$2"; }
cut_to 75 raw.avi
cut_to 60 counted.mkv
cut_to 50 v210-drop.mov   # its index is at its end
make -i raw.avi -f lavfi -i "$(tones 1 mono 10)" -c:v copy -c:a pcm_s16le early.mkv
head -c 3000 early.mkv > cut-early.mkv   # before the end of its first frame
make -f lavfi -i "$(tones 1 mono 1.5)" tone.flac
cut_to 60 tone.flac
head -c 30 tone.flac > cut-early.flac

# Stills
for kind in png jpg tiff dpx bmp; do
	make -f lavfi -i "$(picture 48x32 25)" -frames:v 1 "still.$kind"
done
make -f lavfi -i "$(picture 320x240 25)" -frames:v 1 large-still.jpg   # which is told by its name
cp still.png still-%03d.png
cut_to 60 still.png

# No media
printf 'Notes about a film.\n' > notes.txt
: > empty.mov
: > empty.h264
: > empty.flac
[ -p pipe ] || mkfifo pipe   # that nobody writes to
head -c 2000 stereo.aac | tr '\0-\377' 'a-za-za-za-za-za-za-za-z' > letters.bin
