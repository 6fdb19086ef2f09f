set debuginfod enabled off
set breakpoint pending off
break StopHere
run
up
echo values:\n
output mark
echo \n
output invalid
echo \n
output ntsc
echo \n
output noRate
echo \n
output channel
echo \n
output flags
echo \n
output text
echo \n
output empty
echo \n
