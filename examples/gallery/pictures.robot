# The pictures of docs/gallery.md, one for each page and dialog; see scripts/gallery-pictures.
wait-window Gallery
save-png ${OUT}/buttons.png

# The focus on one button, another one held down.
key tab
key tab
move 160 100
press
save-png ${OUT}/buttons-pressed.png
release

key command+2
click-view efName
key command+a
save-png ${OUT}/text.png

key command+3
click-view slBlock
press
save-png ${OUT}/sliders.png
release

key command+4
save-png ${OUT}/status-bars.png

key command+5
click-view _green
save-png ${OUT}/colours.png

key command+6
save-png ${OUT}/tabs.png

key command+7
click-view lvPlain
save-png ${OUT}/lists.png

key command+8
save-png ${OUT}/menus.png
click-item Sample
wait-window Sample
click-item "One of several"
wait-window Sample
save-png ${OUT}/menu.png
wait-window "One of several"
save-png ${OUT}/menu-sub.png
key escape
key escape
wait-no-window Sample

wait-window Gallery
click-view mfFitted
wait-window size
save-png ${OUT}/menu-field.png
key escape
wait-no-window size

wait-window Gallery
key command+9
save-png ${OUT}/dialogs.png

click-view btnEmpty
wait-window Alert
save-png ${OUT}/alert-empty.png
click-view First
wait-no-window Alert

wait-window Gallery
click-view btnInfo
wait-window Alert
save-png ${OUT}/alert-info.png
click-view First
wait-no-window Alert

wait-window Gallery
click-view btnIdea
wait-window Alert
save-png ${OUT}/alert-idea.png
click-view First
wait-no-window Alert

wait-window Gallery
click-view btnWarning
wait-window Alert
save-png ${OUT}/alert-warning.png
click-view First
wait-no-window Alert

wait-window Gallery
click-view btnStop
wait-window Alert
save-png ${OUT}/alert-stop.png
click-view First
wait-no-window Alert

wait-window Gallery
key command+o
wait-window "gallery: Open"
pause 300
save-png ${OUT}/panel-open.png
key escape

wait-window Gallery
click-view btnSave
wait-window "gallery: Save"
type "letter.txt"
pause 300
save-png ${OUT}/panel-save.png
key escape

wait-window Gallery
quit
