# fish completion for zornet
# SPDX-License-Identifier: MIT

complete -c zornet -s h -l help -d 'Say what there is to say, and end'
complete -c zornet -l version -d 'Say which version this is, and end'
complete -c zornet -x -l solutions -d 'Print up to N full assignments'
complete -c zornet -l trace -d 'Print each narrowing as it happens'
complete -c zornet -x -l explain -d 'Print what brought a variable to its value'
complete -c zornet -l stats -d 'Print calls, changes and contradictions of each operation'
complete -c zornet -l raw -d 'Call the bare operations in the order of the file, once each'
complete -c zornet -l json-stream -d 'Print everything as one JSON object a line'
complete -c zornet -r -F -l dot -d 'Write the network as a graph for Graphviz'
complete -c zornet -r -F -l svg -d 'Write the network as a picture'
complete -c zornet -x -l color -a 'auto always never' -d 'When to use colours'
complete -c zornet -x -l budget -d 'Combinations that one constraint may try for supports'
complete -c zornet -x -l step-limit -d 'Passes over a constraint before giving up'
complete -c zornet -x -l module-path -a '(__fish_complete_directories)' -d 'Look for modules in this folder too'
complete -c zornet -s q -l quiet -d 'No summary at the end'
complete -c zornet -k -x -a '(__fish_complete_suffix .szn)'
