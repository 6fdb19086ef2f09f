#!/bin/sh
# Makes hour-change.mov, the clip that the companion shows when it is given no other: five seconds of colour bars with a
# moving mark and two tones, NTSC (29.97 fps, drop-frame timecode, pixels of 10:11, 48 kHz stereo), whose timecode passes
# a full hour.
#   usage: make-clip.sh [OUTPUT]      needs Debian's ffmpeg; the same version makes the same bytes
set -eu
output=${1:-$(dirname "$0")/hour-change.mov}
frames=150
samples=240240   # of 150 frames: 150 * 1001 / 30000 s at 48 kHz
exec ffmpeg -nostdin -hide_banner -loglevel error -y \
	-f lavfi -i 'smptebars=size=720x480:rate=30000/1001' \
	-f lavfi -i 'color=white:size=16x32:rate=30000/1001' \
	-f lavfi -i 'sine=frequency=440:sample_rate=48000' \
	-f lavfi -i 'sine=frequency=660:sample_rate=48000' \
	-filter_complex "[0:v][1:v]overlay=x='n*704/$frames':y=324,trim=end_frame=$frames,setsar=10/11,\
setparams=color_primaries=smpte170m:color_trc=smpte170m:colorspace=smpte170m:range=limited[picture];\
[2:a][3:a]join=inputs=2:channel_layout=stereo,atrim=end_sample=$samples[sound]" \
	-map '[picture]' -map '[sound]' -threads 1 \
	-c:v mpeg4 -pix_fmt yuv420p -qscale:v 24 -g 300 -bf 0 \
	-c:a aac -b:a 48k \
	-timecode '00:59:58;00' -fflags +bitexact -flags:v +bitexact -flags:a +bitexact -movflags +faststart+write_colr \
	"$output"
