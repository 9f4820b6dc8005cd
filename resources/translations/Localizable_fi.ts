<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fi" sourcelanguage="en">
<context>
    <name>Localizable</name>
    <message>
        <source>%@ Hex Color #</source>
        <extracomment>The button that opens the color space switcher. %@ is the currently selected color space. The button also functions as a label for the hex code that follows in a textfield.</extracomment>
        <translation>Heksaväri %@ #</translation>
    </message>
    <message>
        <source>Add selected color to favorites</source>
        <extracomment>This button adds the currently selected color to the list of favorites</extracomment>
        <translation>Lisää valittu väri suosikkeihin</translation>
    </message>
    <message>
        <source>Blue</source>
        <extracomment>The color blue</extracomment>
        <translation>Sininen</translation>
    </message>
    <message>
        <source>Close</source>
        <extracomment>Button that closes the color picker</extracomment>
        <translation>Sulje</translation>
    </message>
    <message>
        <source>Color Picker Type</source>
        <extracomment>Label for the segmented control that switches between grid, spectrum, sliders</extracomment>
        <translation>Värivalitsimen tyyppi</translation>
    </message>
    <message>
        <source>Color Space</source>
        <extracomment>Menu title for the color space switcher</extracomment>
        <translation>Väriavaruus</translation>
    </message>
    <message>
        <source>Color Spectrum</source>
        <extracomment>Color spectrum control</extracomment>
        <translation>Värispektri</translation>
    </message>
    <message>
        <source>Colors</source>
        <extracomment>Used as headline for the color picker</extracomment>
        <translation>Värit</translation>
    </message>
    <message>
        <source>Copy</source>
        <extracomment>Menu command that copies the selected color</extracomment>
        <translation>Kopioi</translation>
    </message>
    <message>
        <source>Delete</source>
        <extracomment>Command that deletes a favorite color</extracomment>
        <translation>Poista</translation>
    </message>
    <message>
        <source>Display P3</source>
        <extracomment>Name for the display P3 color space.</extracomment>
        <translation>Display P3</translation>
    </message>
    <message>
        <source>Done</source>
        <extracomment>Button that ends editing a number</extracomment>
        <translation>Valmis</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility</source>
        <extracomment>Button that launches eyedropper color picker</extracomment>
        <translation>Pipetti</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative1</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Väripipetti</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative2</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Poimi väri näytöltä</translation>
    </message>
    <message>
        <source>Favorites</source>
        <extracomment>Label for the container of the added favorite colors</extracomment>
        <translation>Suosikit</translation>
    </message>
    <message>
        <source>Green</source>
        <extracomment>The color green</extracomment>
        <translation>Vihreä</translation>
    </message>
    <message>
        <source>Grid</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Ruudukko</translation>
    </message>
    <message>
        <source>Hue</source>
        <extracomment>Vertical axis of the color spectrum</extracomment>
        <translation>Värisävy</translation>
    </message>
    <message>
        <source>Lightness</source>
        <extracomment>Horizontal axis of the color spectrum</extracomment>
        <translation>Vaaleus</translation>
    </message>
    <message>
        <source>No color selected</source>
        <extracomment>Label when no color is selected</extracomment>
        <translation>Väriä ei ole valittu</translation>
    </message>
    <message>
        <source>Opacity</source>
        <extracomment>Label for the opacity slider</extracomment>
        <translation>Peittävyys</translation>
    </message>
    <message>
        <source>Red</source>
        <extracomment>The color red</extracomment>
        <translation>Punainen</translation>
    </message>
    <message>
        <source>Remove color</source>
        <extracomment>Label to clear color selection</extracomment>
        <translation>Poista väri</translation>
    </message>
    <message>
        <source>Selected Color</source>
        <extracomment>The currently selected color</extracomment>
        <translation>Valittu väri</translation>
    </message>
    <message>
        <source>Sliders</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Säätimet</translation>
    </message>
    <message>
        <source>Spectrum</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Spektri</translation>
    </message>
    <message>
        <source>beige</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>beige</translation>
    </message>
    <message>
        <source>black</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>musta</translation>
    </message>
    <message>
        <source>blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>sininen</translation>
    </message>
    <message>
        <source>bluish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>siniharmaa</translation>
    </message>
    <message>
        <source>bluish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>sinivihreä</translation>
    </message>
    <message>
        <source>bluish purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>sinivioletti</translation>
    </message>
    <message>
        <source>bright %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>kirkkaan%@</translation>
    </message>
    <message>
        <source>brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>ruskea</translation>
    </message>
    <message>
        <source>brownish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>ruskeanharmaa</translation>
    </message>
    <message>
        <source>cyan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>syaani</translation>
    </message>
    <message>
        <source>dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>tumman%@</translation>
    </message>
    <message>
        <source>gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>harmaa</translation>
    </message>
    <message>
        <source>grayish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>harmaansininen</translation>
    </message>
    <message>
        <source>grayish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>harmaanvihreä</translation>
    </message>
    <message>
        <source>green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>vihreä</translation>
    </message>
    <message>
        <source>greenish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>vihreänharmaa</translation>
    </message>
    <message>
        <source>lavender</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>laventelinvärinen</translation>
    </message>
    <message>
        <source>light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>vaalean%@</translation>
    </message>
    <message>
        <source>lime green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>limetinvihreä</translation>
    </message>
    <message>
        <source>magenta</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>magenta</translation>
    </message>
    <message>
        <source>maroon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>viininpunainen</translation>
    </message>
    <message>
        <source>medium %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>keski%@</translation>
    </message>
    <message>
        <source>mint green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>mintunvihreä</translation>
    </message>
    <message>
        <source>navy blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>laivastonsininen</translation>
    </message>
    <message>
        <source>olive green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>oliivinvihreä</translation>
    </message>
    <message>
        <source>orange</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>oranssi</translation>
    </message>
    <message>
        <source>peach</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>persikanvärinen</translation>
    </message>
    <message>
        <source>pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>pinkki</translation>
    </message>
    <message>
        <source>pinkish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>pinkinharmaa</translation>
    </message>
    <message>
        <source>purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>violetti</translation>
    </message>
    <message>
        <source>purplish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>violetinsininen</translation>
    </message>
    <message>
        <source>purplish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>violetinharmaa</translation>
    </message>
    <message>
        <source>purplish pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>violetinpinkki</translation>
    </message>
    <message>
        <source>red</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>punainen</translation>
    </message>
    <message>
        <source>reddish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>punaruskea</translation>
    </message>
    <message>
        <source>sRGB</source>
        <extracomment>Name of the sRGB color space.</extracomment>
        <translation>sRGB</translation>
    </message>
    <message>
        <source>salmon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lohenpunainen</translation>
    </message>
    <message>
        <source>sky blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>taivaansininen</translation>
    </message>
    <message>
        <source>tan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>hiekanruskea</translation>
    </message>
    <message>
        <source>teal</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>petrolinsininen</translation>
    </message>
    <message>
        <source>turquoise</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>turkoosi</translation>
    </message>
    <message>
        <source>very dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>hyvin tumman%@</translation>
    </message>
    <message>
        <source>very light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>hyvin vaalean%@</translation>
    </message>
    <message>
        <source>white</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>valkoinen</translation>
    </message>
    <message>
        <source>yellow</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>keltainen</translation>
    </message>
    <message>
        <source>yellowish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>keltaisenruskea</translation>
    </message>
    <message>
        <source>yellowish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>keltaisenharmaa</translation>
    </message>
    <message>
        <source>yellowish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>kellanvihreä</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="vanished">Kumoa</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation type="vanished">Liitä</translation>
    </message>
</context>
</TS>
