-- What the cells of the designs do, as in cells.v. No entity has the name of its cell, so that an
-- instance finds it through the written configuration and CFG_<cell>, or not at all. An unknown
-- value on a control pin makes the output unknown, so that a constant that is not driven shows.

library ieee;
use ieee.std_logic_1164.all;
entity INV_CELL is
    port (A : in std_logic;
          Y : out std_logic);
end INV_CELL;
architecture model of INV_CELL is
begin
    Y <= not A;
end model;
configuration CFG_INV of INV_CELL is for model end for; end CFG_INV;

library ieee;
use ieee.std_logic_1164.all;
entity AND2_CELL is
    port (A : in std_logic;
          B : in std_logic;
          Y : out std_logic);
end AND2_CELL;
architecture model of AND2_CELL is
begin
    Y <= A and B;
end model;
configuration CFG_AND2 of AND2_CELL is for model end for; end CFG_AND2;

library ieee;
use ieee.std_logic_1164.all;
entity OR2_CELL is
    port (A : in std_logic;
          B : in std_logic;
          Y : out std_logic);
end OR2_CELL;
architecture model of OR2_CELL is
begin
    Y <= A or B;
end model;
configuration CFG_OR2 of OR2_CELL is for model end for; end CFG_OR2;

library ieee;
use ieee.std_logic_1164.all;
entity XOR2_CELL is
    port (A : in std_logic;
          B : in std_logic;
          Y : out std_logic);
end XOR2_CELL;
architecture model of XOR2_CELL is
begin
    Y <= A xor B;
end model;
configuration CFG_XOR2 of XOR2_CELL is for model end for; end CFG_XOR2;

library ieee;
use ieee.std_logic_1164.all;
entity FA_CELL is
    port (A : in std_logic;
          B : in std_logic;
          CI : in std_logic;
          S : out std_logic;
          CO : out std_logic);
end FA_CELL;
architecture model of FA_CELL is
begin
    S <= A xor B xor CI;
    CO <= (A and B) or (A and CI) or (B and CI);
end model;
configuration CFG_FA of FA_CELL is for model end for; end CFG_FA;

library ieee;
use ieee.std_logic_1164.all;
entity MUX2X4_CELL is
    port (A : in std_logic_vector (3 downto 0);
          B : in std_logic_vector (3 downto 0);
          S : in std_logic;
          Y : out std_logic_vector (0 to 3));
end MUX2X4_CELL;
architecture model of MUX2X4_CELL is
begin
    with S select Y <= A when '0', B when '1', (others => 'X') when others;
end model;
configuration CFG_MUX2X4 of MUX2X4_CELL is for model end for; end CFG_MUX2X4;

library ieee;
use ieee.std_logic_1164.all;
entity MUX2X16_CELL is
    port (A : in std_logic_vector (15 downto 0);
          B : in std_logic_vector (15 downto 0);
          S : in std_logic;
          Y : out std_logic_vector (15 downto 0));
end MUX2X16_CELL;
architecture model of MUX2X16_CELL is
begin
    with S select Y <= A when '0', B when '1', (others => 'X') when others;
end model;
configuration CFG_MUX2X16 of MUX2X16_CELL is for model end for; end CFG_MUX2X16;

library ieee;
use ieee.std_logic_1164.all;
entity DFF_CELL is
    port (C : in std_logic;
          R : in std_logic;
          E : in std_logic;
          D : in std_logic;
          Q : out std_logic;
          QN : out std_logic);
end DFF_CELL;
architecture model of DFF_CELL is
    signal state : std_logic;
begin
    process (C)
    begin
        if rising_edge(C) then
            if R = '1' then
                state <= '0';
            elsif R = '0' and E = '1' then
                state <= D;
            elsif R /= '0' or E /= '0' then
                state <= 'X';
            end if;
        end if;
    end process;
    Q <= state;
    QN <= not state;
end model;
configuration CFG_DFF of DFF_CELL is for model end for; end CFG_DFF;

library ieee;
use ieee.std_logic_1164.all;
entity REG8_CELL is
    port (C : in std_logic;
          R : in std_logic;
          E : in std_logic;
          D : in std_logic_vector (0 to 7);
          Q : out std_logic_vector (7 downto 0));
end REG8_CELL;
architecture model of REG8_CELL is
begin
    process (C)
    begin
        if rising_edge(C) then
            if R = '1' then
                Q <= (others => '0');
            elsif R = '0' and E = '1' then
                Q <= D;
            elsif R /= '0' or E /= '0' then
                Q <= (others => 'X');
            end if;
        end if;
    end process;
end model;
configuration CFG_REG8 of REG8_CELL is for model end for; end CFG_REG8;
