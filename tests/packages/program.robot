# The generated program, of which the button's handler was written.
limit 60
wait-window Hello
expect-view CountText "No clicks yet"
click-view CountButton
expect-view CountText "It was clicked"
save-png ${OUT}/program.png
quit
