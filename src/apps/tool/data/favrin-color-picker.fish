# fish completion for favrin-color-picker
complete -c favrin-color-picker -f
complete -c favrin-color-picker -s c -l color -x -a 'black white red green blue none' -d 'Begin with this color'
complete -c favrin-color-picker -s t -l title -x -d 'Headline of the picker'
complete -c favrin-color-picker -s s -l suggest -x -d 'Propose a color, NAME=COLOR'
complete -c favrin-color-picker -l no-opacity -d 'Choose opaque colors only'
complete -c favrin-color-picker -l allow-none -d 'Let the user choose no color'
complete -c favrin-color-picker -s f -l format -x -a 'hex hex8 css json' -d 'How the color is printed'
complete -c favrin-color-picker -l live -d 'Print every pick as JSON'
complete -c favrin-color-picker -s p -l parent -x -a 'x11: wayland:' -d 'Belong to this window'
complete -c favrin-color-picker -l timeout -x -d 'Give up after this time in seconds'
complete -c favrin-color-picker -s h -l help -d 'Print a summary of the options'
complete -c favrin-color-picker -s v -l version -d 'Print the version'
