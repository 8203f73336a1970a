/// The parts of the index page that are the same for all documents.
#pragma once

namespace DrawmereConvert {

/// Tells the program that a file is its own.
constexpr const char* indexMark = "<meta name=\"generator\" content=\"drawmere-convert\">";

constexpr const char* indexStyle = R"(
:root { --z: 1; }
body { display: grid; grid: auto minmax(0, 1fr) / auto minmax(0, 1fr); height: 100vh; margin: 0;
    font: 15px/1.4 sans-serif; }
header { grid-column: 1 / 3; display: flex; gap: .3rem; align-items: center;
    padding: .3rem .6rem; background: #222; color: #eee; }
header button { min-width: 2.2rem; height: 1.9rem; font: inherit; color: inherit;
    background: #444; border: 0; border-radius: 4px; cursor: pointer; }
header button:hover, header button:focus-visible { background: #666; }
header input { width: 4.5em; font: inherit; text-align: right; }
header .space { flex: 1; }
nav { grid-column: 1; width: 18rem; overflow: auto; padding: .4rem .8rem 1rem 0;
    background: #eee; }
nav ul { margin: 0; padding-left: 1rem; list-style: none; }
nav a, nav span { display: block; padding: .1rem .2rem; color: #222; text-decoration: none; }
nav a:hover { background: #ddd; }
body:not(.outline) nav { display: none; }
main { grid-column: 2; overflow: auto; padding: 1rem; outline: 0; background: #777; }
section { position: relative; margin: 0 auto 1rem; overflow: hidden; background: #fff;
    width: calc(var(--w) * 1pt * var(--z)); height: calc(var(--h) * 1pt * var(--z)); }
iframe { width: calc(var(--w) * 1pt); height: calc(var(--h) * 1pt); border: 0;
    transform: scale(var(--z)); transform-origin: 0 0; pointer-events: none; }
section a, section i { position: absolute; }
section a:hover, section a:focus-visible { background: #04f2; }
)";

constexpr const char* indexScript = R"(
{
    const pages = [...document.querySelectorAll('section')];
    const find = name => document.getElementById(name);
    const field = find('number');
    const main = document.querySelector('main');
    let zoom = 1;

    function topOf(page) {
        return page.getBoundingClientRect().top - main.getBoundingClientRect().top;
    }

    function current() {
        const line = main.clientHeight / 3;
        let low = 0, high = pages.length - 1;
        while (low < high) {
            const middle = (low + high + 1) >> 1;
            if (topOf(pages[middle]) <= line) { low = middle; } else { high = middle - 1; }
        }
        return low;
    }

    function show(number) {
        const page = pages[Math.max(0, Math.min(pages.length - 1, number))];
        page.scrollIntoView();
        field.value = pages.indexOf(page) + 1;
    }

    function setZoom(value) {
        const page = pages[current()];
        const place = topOf(page) / page.offsetHeight;
        zoom = Math.max(.1, Math.min(10, value));
        document.documentElement.style.setProperty('--z', zoom);
        find('zoom').textContent = Math.round(100 * zoom) + ' %';
        main.scrollBy(0, topOf(page) - place * page.offsetHeight);
    }

    function fit() {
        const width = Math.max(...pages.map(page => page.offsetWidth)) / zoom;
        setZoom((main.clientWidth - 36) / width);
    }

    function toggle() { document.body.classList.toggle('outline'); }

    const actions = {
        previous: () => show(current() - 1), next: () => show(current() + 1),
        smaller: () => setZoom(zoom / 1.2), zoom: () => setZoom(1), larger: () => setZoom(zoom * 1.2),
        fit: fit, outline: toggle,
    };
    const keys = {
        ArrowLeft: 'previous', k: 'previous', p: 'previous', ArrowRight: 'next', j: 'next', n: 'next',
        '-': 'smaller', '0': 'zoom', '+': 'larger', '=': 'larger', w: 'fit', o: 'outline',
    };

    for (const button of document.querySelectorAll('button')) {
        button.addEventListener('click', actions[button.id]);
    }
    field.addEventListener('change', () => show(field.value - 1));
    addEventListener('keydown', event => {
        const name = keys[event.key];
        if (name && event.target !== field && !event.ctrlKey && !event.metaKey && !event.altKey) {
            event.preventDefault();
            actions[name]();
        }
    });
    main.addEventListener('scroll', () => {
        if (document.activeElement !== field) { field.value = current() + 1; }
    }, {passive: true});

    // A page is read when it comes near and dropped when it is far away again.
    function place(section, isNear) {
        const frame = section.querySelector('iframe');
        if (!isNear && frame) { frame.remove(); }
        if (!isNear || frame) { return; }
        const fresh = document.createElement('iframe');
        fresh.src = section.dataset.file;
        fresh.title = 'Page ' + section.id.slice(1);
        fresh.tabIndex = -1;
        fresh.scrolling = 'no';
        section.prepend(fresh);
    }
    const observer = new IntersectionObserver(
        entries => entries.forEach(entry => place(entry.target, entry.isIntersecting)),
        {root: main, rootMargin: '150% 0px'});
    pages.forEach(page => observer.observe(page));
    main.focus();
}
)";

} // namespace DrawmereConvert
