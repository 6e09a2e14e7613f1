"""What is measured within the page."""

from browser import SETTLE

# The least contrast between text and background of all cells, names and remarks that are shown.
LEAST_CONTRAST = """
const channels = color => color.match(/[0-9.]+/g).map(Number);
const luminance = color => channels(color).slice(0, 3)
    .map(value => value / 255)
    .map(value => value <= 0.04045 ? value / 12.92 : ((value + 0.055) / 1.055) ** 2.4)
    .reduce((sum, value, index) => sum + value * [0.2126, 0.7152, 0.0722][index], 0);
const background = node => {
    const color = getComputedStyle(node).backgroundColor;
    return channels(color)[3] === 0 ? background(node.parentNode) : color;
};
return Math.min(...[...document.querySelectorAll(
        '.cell, .front, .requested, .meaning, .label, .help, .legend, .quiet, .corner, .files')]
    .filter(node => !node.closest('[hidden]')).map(node => {
        const [low, high] = [luminance(getComputedStyle(node).color), luminance(background(node))]
            .sort((a, b) => a - b);
        return (high + 0.05) / (low + 0.05);
    }));
"""

# Scrolls by so many steps of so many pixels to the right and down; tells how many nodes changed in
# a step, and how long a frame took.
SCROLL = SETTLE + """
const [steps, right, down, done] = arguments;
const grid = document.getElementById('grid');
const touched = [], frames = [], longTasks = [];
let changed = new Set();
const observer = new PerformanceObserver(list => longTasks.push(...list.getEntries()));
observer.observe({ type: 'longtask' });
new MutationObserver(changes => changes.forEach(change => changed.add(change.target)))
    .observe(document.body, { subtree: true, childList: true, characterData: true,
        attributes: true });
(async () => {
    await settle();
    let before = performance.now();
    for (let step = 0; step < steps; ++step) {
        changed = new Set();
        grid.scrollBy(right, down);
        await settle();
        touched.push(changed.size);
        frames.push((performance.now() - before) / 2);
        before = performance.now();
    }
    longTasks.push(...observer.takeRecords());
    frames.sort((a, b) => a - b);
    done({ least: Math.min(...touched), most: Math.max(...touched),
        nodes: document.getElementsByTagName('*').length,
        median: frames[steps >> 1], slowest: frames[steps - 1],
        longTasks: longTasks.map(task => Math.round(task.duration)) });
})();
"""
