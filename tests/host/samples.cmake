# SPDX-License-Identifier: Apache-2.0
# Makes the media files that the tests describe: cmake -DFFMPEG=... -DFOLDER=... -P samples.cmake
# What the tests expect is what ffmpeg is told here.

function(sample name)
    execute_process(
        COMMAND "${FFMPEG}" -nostdin -loglevel error -y ${ARGN} "${FOLDER}/${name}"
        COMMAND_ERROR_IS_FATAL ANY)
endfunction()

function(picture_source variable size rate)
    set(${variable} -f lavfi -i "testsrc2=size=${size}:rate=${rate}" PARENT_SCOPE)
endfunction()

function(sound_source variable rate layout)
    set(${variable} -f lavfi -i "anoisesrc=sample_rate=${rate}:amplitude=0.1:seed=1,aformat=channel_layouts=${layout}"
        PARENT_SCOPE)
endfunction()

# Newer versions of ffmpeg turn with an option, older ones with metadata.
execute_process(COMMAND "${FFMPEG}" -hide_banner -h full OUTPUT_VARIABLE help ERROR_QUIET)
function(turned name degrees original)
    if(help MATCHES "-display_rotation")
        sample(${name} -display_rotation ${degrees} -i "${FOLDER}/${original}" -c copy)
    else()
        sample(${name} -i "${FOLDER}/${original}" -c copy -metadata:s:v:0 rotate=${degrees})
    endif()
endfunction()

file(MAKE_DIRECTORY "${FOLDER}")

picture_source(picture 320x240 25)
sound_source(sound 48000 stereo)
sample(film.mp4 ${picture} ${sound} -t 2 -c:v mpeg4 -c:a aac -b:a 96k)
sample(variable-rate.mpg ${picture} -t 1 -c:v mpeg1video)
sample(long.mkv ${picture} ${sound} -t 4 -c:v mpeg4 -b:v 400k -c:a pcm_s16le)

turned(film-quarter-turn.mp4 90 film.mp4)
turned(film-half-turn.mp4 180 film.mp4)

picture_source(picture 180x144 25)
sample(wide-pixels.mov ${picture} -vf setsar=64/45 -t 1 -c:v mpeg4)
turned(wide-pixels-quarter-turn.mov 90 wide-pixels.mov)

picture_source(picture 160x120 24000/1001)
sample(cinema.mkv ${picture} -frames:v 48 -c:v mpeg4)

picture_source(first 160x120 25)
picture_source(second 96x64 10)
sound_source(third 44100 mono)
sound_source(fourth 48000 stereo)
sound_source(fifth 48000 5.1)
sample(tracks.mkv ${first} ${second} ${third} ${fourth} ${fifth} -t 1
    -map 0 -map 2 -map 1 -map 3 -map 4
    -c:v:0 mpeg4 -c:v:1 ffv1 -c:a:0 pcm_s16le -c:a:1 flac -c:a:2 ac3)

# A patch that goes 2 pixels to the right and 1 down with every picture; in the first it is at (22, 31), since
# the filter counts from 1.
sample(patch.mkv -f lavfi -i "color=gray:size=160x120:rate=25"
    -f lavfi -i "testsrc2=size=40x32:rate=25:duration=0.04"
    -filter_complex "overlay=x=20+2*n:y=30+n:format=yuv444" -frames:v 25 -pix_fmt yuv444p -c:v ffv1)

sound_source(sound 44100 mono)
sample(speech.wav ${sound} -t 1.5 -c:a pcm_s16le)
sound_source(sound 48000 5.1)
sample(surround.flac ${sound} -t 1 -c:a flac -sample_fmt s16)

picture_source(picture 64x48 1)
sample(picture.png ${picture} -frames:v 1 -pix_fmt rgb24)
sample(glass.png ${picture} -frames:v 1 -pix_fmt rgba)
sample(picture.tga ${picture} -frames:v 1 -pix_fmt bgr24)
picture_source(picture 80x60 1)
sample(picture.jpg ${picture} -frames:v 1 -pix_fmt yuvj420p)
picture_source(picture 40x30 10)
sample(moving.gif ${picture} -frames:v 12)

sound_source(sound 44100 stereo)
sample(song.mp3 ${sound} -i "${FOLDER}/picture.jpg" -map 0 -map 1 -t 2 -c:a libmp3lame -b:a 128k -c:v copy
    -disposition:v:0 attached_pic -id3v2_version 3)
