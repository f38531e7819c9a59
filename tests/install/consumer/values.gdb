# Shows each value that the program prints, in a form of the debugger's own.
set may-call-functions off
set print object on
set print elements 0
break Show
commands
silent
output value
echo \n
continue
end
run >/dev/null
