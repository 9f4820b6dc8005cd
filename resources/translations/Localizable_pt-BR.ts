<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pt_BR" sourcelanguage="en">
<context>
    <name>Localizable</name>
    <message>
        <source>%@ Hex Color #</source>
        <extracomment>The button that opens the color space switcher. %@ is the currently selected color space. The button also functions as a label for the hex code that follows in a textfield.</extracomment>
        <translation>Cor hexadecimal %@ #</translation>
    </message>
    <message>
        <source>Add selected color to favorites</source>
        <extracomment>This button adds the currently selected color to the list of favorites</extracomment>
        <translation>Adicionar cor selecionada aos favoritos</translation>
    </message>
    <message>
        <source>Blue</source>
        <extracomment>The color blue</extracomment>
        <translation>Azul</translation>
    </message>
    <message>
        <source>Close</source>
        <extracomment>Button that closes the color picker</extracomment>
        <translation>Fechar</translation>
    </message>
    <message>
        <source>Color Picker Type</source>
        <extracomment>Label for the segmented control that switches between grid, spectrum, sliders</extracomment>
        <translation>Tipo de seletor de cores</translation>
    </message>
    <message>
        <source>Color Space</source>
        <extracomment>Menu title for the color space switcher</extracomment>
        <translation>Espaço de cores</translation>
    </message>
    <message>
        <source>Color Spectrum</source>
        <extracomment>Color spectrum control</extracomment>
        <translation>Espectro de cores</translation>
    </message>
    <message>
        <source>Colors</source>
        <extracomment>Used as headline for the color picker</extracomment>
        <translation>Cores</translation>
    </message>
    <message>
        <source>Copy</source>
        <extracomment>Menu command that copies the selected color</extracomment>
        <translation>Copiar</translation>
    </message>
    <message>
        <source>Delete</source>
        <extracomment>Command that deletes a favorite color</extracomment>
        <translation>Apagar</translation>
    </message>
    <message>
        <source>Display P3</source>
        <extracomment>Name for the display P3 color space.</extracomment>
        <translation>Display P3</translation>
    </message>
    <message>
        <source>Done</source>
        <extracomment>Button that ends editing a number</extracomment>
        <translation>Concluir</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility</source>
        <extracomment>Button that launches eyedropper color picker</extracomment>
        <translation>Conta-gotas</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative1</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Conta-gotas de cor</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative2</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Escolher cor da tela</translation>
    </message>
    <message>
        <source>Favorites</source>
        <extracomment>Label for the container of the added favorite colors</extracomment>
        <translation>Favoritos</translation>
    </message>
    <message>
        <source>Green</source>
        <extracomment>The color green</extracomment>
        <translation>Verde</translation>
    </message>
    <message>
        <source>Grid</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Grade</translation>
    </message>
    <message>
        <source>Hue</source>
        <extracomment>Vertical axis of the color spectrum</extracomment>
        <translation>Matiz</translation>
    </message>
    <message>
        <source>Lightness</source>
        <extracomment>Horizontal axis of the color spectrum</extracomment>
        <translation>Luminosidade</translation>
    </message>
    <message>
        <source>No color selected</source>
        <extracomment>Label when no color is selected</extracomment>
        <translation>Nenhuma cor selecionada</translation>
    </message>
    <message>
        <source>Opacity</source>
        <extracomment>Label for the opacity slider</extracomment>
        <translation>Opacidade</translation>
    </message>
    <message>
        <source>Red</source>
        <extracomment>The color red</extracomment>
        <translation>Vermelho</translation>
    </message>
    <message>
        <source>Remove color</source>
        <extracomment>Label to clear color selection</extracomment>
        <translation>Remover cor</translation>
    </message>
    <message>
        <source>Selected Color</source>
        <extracomment>The currently selected color</extracomment>
        <translation>Cor selecionada</translation>
    </message>
    <message>
        <source>Sliders</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Controles</translation>
    </message>
    <message>
        <source>Spectrum</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Espectro</translation>
    </message>
    <message>
        <source>beige</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>bege</translation>
    </message>
    <message>
        <source>black</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>preto</translation>
    </message>
    <message>
        <source>blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>azul</translation>
    </message>
    <message>
        <source>bluish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cinza-azulado</translation>
    </message>
    <message>
        <source>bluish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verde-azulado</translation>
    </message>
    <message>
        <source>bluish purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>roxo-azulado</translation>
    </message>
    <message>
        <source>bright %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ vivo</translation>
    </message>
    <message>
        <source>brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marrom</translation>
    </message>
    <message>
        <source>brownish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cinza-amarronzado</translation>
    </message>
    <message>
        <source>cyan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>ciano</translation>
    </message>
    <message>
        <source>dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ escuro</translation>
    </message>
    <message>
        <source>gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cinza</translation>
    </message>
    <message>
        <source>grayish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>azul-acinzentado</translation>
    </message>
    <message>
        <source>grayish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verde-acinzentado</translation>
    </message>
    <message>
        <source>green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verde</translation>
    </message>
    <message>
        <source>greenish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cinza-esverdeado</translation>
    </message>
    <message>
        <source>lavender</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lavanda</translation>
    </message>
    <message>
        <source>light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ claro</translation>
    </message>
    <message>
        <source>lime green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verde-limão</translation>
    </message>
    <message>
        <source>magenta</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>magenta</translation>
    </message>
    <message>
        <source>maroon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>bordô</translation>
    </message>
    <message>
        <source>medium %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ médio</translation>
    </message>
    <message>
        <source>mint green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verde-menta</translation>
    </message>
    <message>
        <source>navy blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>azul-marinho</translation>
    </message>
    <message>
        <source>olive green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verde-oliva</translation>
    </message>
    <message>
        <source>orange</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>laranja</translation>
    </message>
    <message>
        <source>peach</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>pêssego</translation>
    </message>
    <message>
        <source>pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rosa</translation>
    </message>
    <message>
        <source>pinkish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cinza-rosado</translation>
    </message>
    <message>
        <source>purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>roxo</translation>
    </message>
    <message>
        <source>purplish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>azul-arroxeado</translation>
    </message>
    <message>
        <source>purplish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cinza-arroxeado</translation>
    </message>
    <message>
        <source>purplish pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rosa-arroxeado</translation>
    </message>
    <message>
        <source>red</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>vermelho</translation>
    </message>
    <message>
        <source>reddish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marrom-avermelhado</translation>
    </message>
    <message>
        <source>sRGB</source>
        <extracomment>Name of the sRGB color space.</extracomment>
        <translation>sRGB</translation>
    </message>
    <message>
        <source>salmon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>salmão</translation>
    </message>
    <message>
        <source>sky blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>azul-celeste</translation>
    </message>
    <message>
        <source>tan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>castanho-areia</translation>
    </message>
    <message>
        <source>teal</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>azul-petróleo</translation>
    </message>
    <message>
        <source>turquoise</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>turquesa</translation>
    </message>
    <message>
        <source>very dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ muito escuro</translation>
    </message>
    <message>
        <source>very light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ muito claro</translation>
    </message>
    <message>
        <source>white</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>branco</translation>
    </message>
    <message>
        <source>yellow</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>amarelo</translation>
    </message>
    <message>
        <source>yellowish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marrom-amarelado</translation>
    </message>
    <message>
        <source>yellowish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cinza-amarelado</translation>
    </message>
    <message>
        <source>yellowish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verde-amarelado</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="vanished">Cancelar</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation type="vanished">Colar</translation>
    </message>
</context>
</TS>
