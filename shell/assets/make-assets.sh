#!/usr/bin/env bash
# Draws Penmoor's splash picture and application icon with ImageMagick. The results are
# committed beside this script; run it again only to change the design.
#   Splash/penmoor-splash.png   480 x 300, shown at start-up
#   icons/penmoor-<size>.png    16 to 256 pixels square
set -euo pipefail
cd "$(dirname "$0")"

title_font=Liberation-Sans-Bold
text_font=Liberation-Sans

# Splash: a dark teal field with a faint sheet grid, monthly bars of receipts (green) and
# payments (amber), and the running cash position as a light line over them.
grid=()
for y in $(seq 170 16 282); do grid+=(-draw "line 240,$y 460,$y"); done
for x in $(seq 240 22 460); do grid+=(-draw "line $x,170 $x,282"); done

bars=()
heights=(34 46 40 58 52 70 64 82)
for i in "${!heights[@]}"; do
    x=$((252 + i * 26))
    h=${heights[$i]}
    if (( i % 3 == 2 )); then colour='#f2b544'; else colour='#6fd08c'; fi
    bars+=(-fill "$colour" -draw "rectangle $x,$((270 - h)) $((x + 14)),270")
done

convert -size 480x300 gradient:'#0e3a52-#1d6c86' \
    -stroke 'rgba(255,255,255,0.14)' -fill 'rgba(255,255,255,0.14)' -strokewidth 1 "${grid[@]}" \
    -stroke none "${bars[@]}" \
    -stroke '#e8f4f8' -strokewidth 3 -fill none -draw "stroke-linejoin round \
        path 'M 259,226 L 285,214 L 311,220 L 337,198 L 363,204 L 389,182 L 415,188 L 441,166'" \
    -stroke none -fill '#e8f4f8' \
    -draw "circle 441,166 446,166" \
    -fill '#9fc9d9' -draw "rectangle 240,270 460,272" \
    -font "$title_font" -pointsize 58 -fill white -annotate +30+112 'Penmoor' \
    -font "$text_font" -pointsize 19 -fill '#bfe3ef' -annotate +33+146 'Cash-flow planning workbook' \
    -pointsize 13 -fill '#8fbccd' -annotate +33+272 'By Year  ·  By Month  ·  By Week' \
    -strip Splash/penmoor-splash.png

# Icon: a rounded teal tile with three rising bars and the cash line above them.
convert -size 256x256 xc:none \
    -fill '#155a73' -draw "roundrectangle 8,8 247,247 44,44" \
    -fill '#1d7c99' -draw "roundrectangle 8,8 247,140 44,44" -draw "rectangle 8,96 247,140" \
    -fill '#6fd08c' -draw "rectangle 48,150 92,212" \
    -fill '#f2b544' -draw "rectangle 106,118 150,212" \
    -fill '#6fd08c' -draw "rectangle 164,80 208,212" \
    -fill white -draw "rectangle 40,212 216,222" \
    -stroke white -strokewidth 12 -fill none -draw "stroke-linecap round stroke-linejoin round \
        path 'M 60,128 L 128,96 L 186,56'" \
    -stroke none -fill white -draw "circle 190,52 203,52" \
    -strip icons/penmoor-256.png
for size in 16 32 48 64 128; do
    convert icons/penmoor-256.png -filter Lanczos -resize ${size}x${size} -strip icons/penmoor-$size.png
done
