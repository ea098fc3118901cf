# The pictures that hello_on_x.py expects to see on the screen.
wait-window Hello
save-png ${PICTURES}/start.png
click-view CountButton
expect-view CountText "1 click"
save-png ${PICTURES}/once.png
click-view CountButton
expect-view CountText "2 clicks"
save-png ${PICTURES}/twice.png
click-view NameField
type "World"
expect-view GreetingText "Hello, World!"
save-png ${PICTURES}/named.png
click-view ShoutBox
expect-view GreetingText "HELLO, WORLD!"
save-png ${PICTURES}/shouted.png
print-view GreetingText
click-view NameField
key command+a
type "Moon"
expect-view GreetingText "HELLO, MOON!"
save-png ${PICTURES}/pasted.png
click-view NoteButton
wait-window Note
save-png ${PICTURES}/note.png
close-window
wait-no-window Note
wait-window Hello
click-view QuitButton
wait-no-window Hello
