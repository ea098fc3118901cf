# A user of the gallery: works each kind of control and is told what it sent.
wait-window Gallery
click-view btnPlain
expect-view svStatus "Used: btnPlain, value 1"
click-view cbOff
expect-view svStatus "Used: cbOff, value 1"
click-view rbOne
expect-view svStatus "Used: rbOne, value 1"
expect-value rbTwo 0
click-view pbTwoOff
expect-view svStatus "Used: pbTwoOff, value 1"
click-view pbTwoOn
expect-view svStatus "Used: pbTwoOn, value 0"
# A disabled one is left alone.
click-view btnOff
expect-view svStatus "Used: pbTwoOn, value 0"

# Cut from one field, pasted into another.
key command+2
click-view efName
key command+a
key command+x
expect-view efName ""
click-view efBare
click-item Edit
click-item "Select all"
click-item Edit
click-item Paste
expect-view efBare "Ada Lovelace"
key enter
expect-view svStatus "Used: efBare, value 0"

key command+3
click-view slBlock
expect-view svStatus "Used: slBlock, value 50"
key tab
key tab
key end
expect-view svStatus "Used: slBlock, value 100"
key left
expect-value slBlock 99

key command+5
click-view _blue
key command+a
type "200"
key enter
expect-view _blue "200"

key command+7
click-view lvPlain
key up
expect-view svStatus "Used: lvPlain, item 1"

key command+8
click-view mfFitted
click-item Large
expect-view svStatus "Used: a menu, item 2"

# From a menu: an alert, and a panel.
key command+9
click-item Alert
click-item Warning
wait-window Alert
click-view Second
wait-no-window Alert
wait-window Gallery
expect-view svStatus "The alert was answered with button 2"

click-item File
click-item "Save…"
wait-window "gallery: Save"
type "letter.txt"
click-view Save
wait-no-window "gallery: Save"
wait-window Gallery
expect-view svStatus "To be saved as: letter.txt"

close-window
