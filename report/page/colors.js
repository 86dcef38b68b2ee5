// Colours that readers with any kind of colour vision can tell apart; dashes repeat them. Those of bands are
// backgrounds for text.
const kThemes = {
    light: {
        lines: ['#0063a6', '#c04a00', '#00795a', '#a3417f', '#7a5c00', '#454545', '#6a4fc4', '#0f7d99'],
        bands: ['#bcd9f2', '#f7d2b4', '#bfe6d4', '#edcfe3', '#eee2a6', '#d8d8d8', '#d7cff6', '#bce4ee'],
        text: '#1b1f24', grid: '#e3e6ea', axis: '#8a929c', gap: '#eceef1', change: '#8a929c', page: '#ffffff',
    },
    dark: {
        lines: ['#62b6f2', '#ff9a5c', '#45cfa2', '#f29cc8', '#e3bd45', '#d5d5d5', '#b7a6ff', '#63d3e6'],
        bands: ['#1f4f77', '#783f17', '#155a43', '#6c325a', '#5d4f05', '#4b4f55', '#473d86', '#155968'],
        text: '#eceff3', grid: '#2b3138', axis: '#7d8794', gap: '#22272d', change: '#8d97a3', page: '#14171b',
    },
};
const kDashes = [null, [7, 4], [2, 3]];
const kBorders = ['solid', 'dashed', 'dotted'];

const theme = {
    chosen: null, // else the system's
    isPrinting: false,
    onChange: [],

    name() {
        if (this.isPrinting)
            return 'light';
        return this.chosen ?? (matchMedia('(prefers-color-scheme: dark)').matches ? 'dark' : 'light');
    },
    colors() { return kThemes[this.name()]; },
    apply() {
        document.documentElement.dataset.theme = this.name();
        byId('theme').textContent = this.name() === 'dark' ? 'Light' : 'Dark';
        this.onChange.forEach((listener) => listener());
    },
    toggle() {
        this.chosen = this.name() === 'dark' ? 'light' : 'dark';
        this.apply();
    },
};
const lineColor = (index) => theme.colors().lines[index % theme.colors().lines.length];
const dashOf = (index) => Math.floor(index / kThemes.light.lines.length) % kDashes.length;
