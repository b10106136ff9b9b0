# Completion of vesk-hdl for fish.

set -l commands run check shell commands header
set -l file_commands run check header

complete -c vesk-hdl -f
complete -c vesk-hdl -n "__fish_seen_subcommand_from $file_commands" -F
complete -c vesk-hdl -l help -d 'Print help'
complete -c vesk-hdl -n __fish_use_subcommand -l version -d 'Print the version'
complete -c vesk-hdl -n __fish_use_subcommand -a run -d 'Run the lines of command files'
complete -c vesk-hdl -n __fish_use_subcommand -a check -d 'Report what will be wrong in the text'
complete -c vesk-hdl -n __fish_use_subcommand -a shell -d 'An interactive session'
complete -c vesk-hdl -n __fish_use_subcommand -a commands -d 'The reference of the commands'
complete -c vesk-hdl -n __fish_use_subcommand -a header -d 'Write the header alone'

function __vesk_hdl_option -a command option
    complete -c vesk-hdl -n "__fish_seen_subcommand_from $command" -l $option $argv[3..]
end

for command in run check shell
    __vesk_hdl_option $command model -x -d 'Name of the design'
    __vesk_hdl_option $command max-memory -x -d 'End when more memory is needed'
    __vesk_hdl_option $command max-output -x -d 'End when more would be written'
end
for command in run check
    __vesk_hdl_option $command diagnostics -x -a 'text json' -d 'Form of messages'
    __vesk_hdl_option $command color -x -a 'auto always never' -d 'Colour in messages'
end
for command in run shell
    __vesk_hdl_option $command output-dir -x -a '(__fish_complete_directories)' -d 'Folder of relative names'
end
__vesk_hdl_option run vhdl -r -F -d 'Write the design as VHDL'
__vesk_hdl_option run verilog -r -F -d 'Write the design as Verilog'
__vesk_hdl_option run restrict -x -a '(__fish_complete_directories)' -d 'Only new HDL files, only in it'
__vesk_hdl_option run restrict-overwrite -d 'Replace files of that folder, too'
__vesk_hdl_option run restrict-suffix -x -d 'Further suffixes of files'
__vesk_hdl_option run keep-going -d 'Go on after a refused line'
__vesk_hdl_option run stats -d 'Print the size of the design, time and memory'
__vesk_hdl_option run quiet -d 'Errors a line each and nothing else'
__vesk_hdl_option run progress -x -a 'auto always never' -d 'A bar on standard error'
__vesk_hdl_option check language -x -a 'vhdl verilog both' -d 'Language to check for'
__vesk_hdl_option check strict -d 'Findings count as errors'
__vesk_hdl_option check off -x -d 'Checks to leave out'
__vesk_hdl_option check only -x -d 'Checks to make'
__vesk_hdl_option check list -d 'List the checks'
for command in check commands
    __vesk_hdl_option $command markdown -d 'Print it as a page'
end
__vesk_hdl_option header verilog -d 'Comments of Verilog'
__vesk_hdl_option header vhdl -d 'Comments of VHDL'
for field in design application command device purpose reference
    __vesk_hdl_option header $field -x -d "The field $field"
end
