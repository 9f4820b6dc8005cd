import Favrin.Sliders

/* The sliders, in a file of their own because they are loaded when their tab is first shown. */
RGBAView {}
