-- Bolt circle: n holes on a diameter d, in mm
local function holes(n, d)
  for i = 0, n - 1 do
    print(string.format("%.2f,%.2f", d / 2 * math.cos(2 * math.pi * i / n), 0))
  end
end
holes(6, 120) -- "PCD 120" \ 6 x {M12}
