// The splash's picture is seen before the program is there: at once, and where the program will show it, which is where
// page_layout.cpp has it. Not where only the help page is wanted.
{
  const splash = /** @type {HTMLElement} */ (document.getElementById('splash'));
  const ratio = devicePixelRatio;
  let scale = Math.min(Math.floor(8 * ratio) / 4, 4);
  const hasRoom = () =>
    686 * scale <= innerWidth * ratio && 565 * scale + Math.max(26 * scale, 28 * ratio) <= innerHeight * ratio;
  while (scale > 1 && !hasRoom()) scale -= 0.25;
  splash.style.width = `${(680 * scale) / ratio}px`;
  splash.hidden = location.hash === '#help';
}
